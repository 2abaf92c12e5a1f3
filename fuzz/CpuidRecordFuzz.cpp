// A core's CPUID snapshot (node 607).
#include "FuzzInput.h"
#include "processor/CpuidRecord.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    unsigned char record[Processor::cpuidRecordSize];
    tvxfuzz::fillRecord(record, data, size);
    Processor::ProcessorDetails details{};
    Processor::decodeCpuidRecord(record, details);
    tvxfuzz::requireTerminated(details.stepping);
    return 0;
}

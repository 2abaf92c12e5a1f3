// A core's CPUID snapshot (node 607).
#include "FuzzInput.h"
#include "processor/CpuidRecord.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    using namespace Processor;
    const auto details = tvxfuzz::decodeRecord<cpuidRecordSize, ProcessorDetails>(data, size, decodeCpuidRecord);
    tvxfuzz::requireTerminated(details.stepping);
    return 0;
}

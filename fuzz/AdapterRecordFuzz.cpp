// The kernel's adapter record (node 72).
#include "FuzzInput.h"
#include "ethernet/AdapterRecord.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    unsigned char record[EthernetProvider::adapterRecordSize];
    tvxfuzz::fillRecord(record, data, size);
    EthernetProvider::PnicDetails details{};
    EthernetProvider::decodeAdapterRecord(record, details);
    tvxfuzz::requireTerminated(details.driverName);
    tvxfuzz::requireTerminated(details.driverVersion);
    tvxfuzz::requireTerminated(details.firmwareVersion);
    tvxfuzz::requireTerminated(details.interfaceName);
    return 0;
}

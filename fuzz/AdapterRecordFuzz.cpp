// The kernel's adapter record (node 72).
#include "FuzzInput.h"
#include "ethernet/AdapterRecord.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    using namespace EthernetProvider;
    const auto details = tvxfuzz::decodeRecord<adapterRecordSize, PnicDetails>(data, size, decodeAdapterRecord);
    tvxfuzz::requireTerminated(details.driverName);
    tvxfuzz::requireTerminated(details.driverVersion);
    tvxfuzz::requireTerminated(details.firmwareVersion);
    tvxfuzz::requireTerminated(details.interfaceName);
    return 0;
}

#include "nodes/AdapterRecord.h"

#include "nodes/RecordBytes.h"

namespace hostsim {

void encodeAdapterRecord(const AdapterProfile &adapter, unsigned char *record) {
    putText(record + 0, 32, adapter.texts->driverName);
    putText(record + 32, 32, adapter.texts->driverVersion);
    putText(record + 64, 32, adapter.texts->firmwareVersion);
    putText(record + 128, 32, adapter.texts->interfaceName);
    putUnsigned(record + 160, adapter.capabilities, 4);
    putUnsigned(record + 164, adapter.enabledCapabilities, 4);
    putUnsigned(record + 172, adapter.pciBus, 4);
    putUnsigned(record + 176, adapter.pciSlot, 4);
    putUnsigned(record + 180, adapter.pciFunction, 4);
    putUnsigned(record + 184, adapter.pciVendorId, 2);
    putUnsigned(record + 186, adapter.pciDeviceId, 2);
    putUnsigned(record + 189, adapter.linkUp, 1);
    putUnsigned(record + 190, adapter.speedMbps, 2);
    putUnsigned(record + 192, adapter.fullDuplex, 1);
    putText(record + 1225, adapterRecordSize - 1225, adapter.texts->mac);
}

}  // namespace hostsim

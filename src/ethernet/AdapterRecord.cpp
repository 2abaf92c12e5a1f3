#include "ethernet/AdapterRecord.h"

#include <cstdio>
#include <cstring>

#include "frame/BoundedText.h"
#include "frame/LittleEndian.h"

namespace EthernetProvider {
namespace {

using frame::littleEndian;

constexpr std::size_t driverNameAt = 0;
constexpr std::size_t driverVersionAt = 32;
constexpr std::size_t firmwareVersionAt = 64;
constexpr std::size_t interfaceNameAt = 128;
constexpr std::size_t textFieldWidth = 32;
constexpr std::size_t capabilitiesAt = 160;
constexpr std::size_t enabledCapabilitiesAt = 164;
constexpr std::size_t pciBusAt = 172;
constexpr std::size_t pciSlotAt = 176;
constexpr std::size_t pciFunctionAt = 180;
constexpr std::size_t pciVendorAt = 184;
constexpr std::size_t pciDeviceAt = 186;
constexpr std::size_t linkUpAt = 189;
constexpr std::size_t speedAt = 190;
constexpr std::size_t fullDuplexAt = 192;
constexpr std::size_t macTextAt = 1225;
constexpr std::size_t macTextWidth = adapterRecordSize - macTextAt;

const char *textAt(const unsigned char (&record)[adapterRecordSize], std::size_t offset) {
    return reinterpret_cast<const char *>(record + offset);
}

}  // namespace

void parseMacAddress(const char *text, std::size_t textLimit, uint8_t (&mac)[6]) {
    std::memset(mac, 0, sizeof mac);
    char terminated[32];
    frame::copyBounded(terminated, text, textLimit);
    // Unchecked on purpose: a partly readable address keeps the pairs it has.
    (void)std::sscanf(terminated, "%02hhx:%02hhx:%02hhx:%02hhx:%02hhx:%02hhx", &mac[0], &mac[1],
                      &mac[2], &mac[3], &mac[4], &mac[5]);
}

void decodeAdapterRecord(const unsigned char (&record)[adapterRecordSize], PnicDetails &details) {
    parseMacAddress(textAt(record, macTextAt), macTextWidth, details.macAddress);
    frame::copyBounded(details.driverName, textAt(record, driverNameAt), textFieldWidth);
    frame::copyBounded(details.driverVersion, textAt(record, driverVersionAt), textFieldWidth);
    frame::copyBounded(details.firmwareVersion, textAt(record, firmwareVersionAt), textFieldWidth);
    frame::copyBounded(details.interfaceName, textAt(record, interfaceNameAt), textFieldWidth);
    details.capabilities = littleEndian(record + capabilitiesAt, 4);
    details.enabledCapabilities = littleEndian(record + enabledCapabilitiesAt, 4);
    details.pciBus = littleEndian(record + pciBusAt, 4);
    details.pciSlot = littleEndian(record + pciSlotAt, 4);
    details.pciFunction = littleEndian(record + pciFunctionAt, 4);
    details.pciVendorId = littleEndian(record + pciVendorAt, 2);
    details.pciDeviceId = littleEndian(record + pciDeviceAt, 2);
    details.linkUp = record[linkUpAt];
    details.speedMbps = littleEndian(record + speedAt, 2);
    details.fullDuplex = record[fullDuplexAt];
}

}  // namespace EthernetProvider

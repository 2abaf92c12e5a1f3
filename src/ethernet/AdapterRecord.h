// Decoding of the kernel's adapter record (node 72) into a PnicDetails.
#pragma once

#include <cstddef>

#include "ethernet/PnicDetails.h"

namespace EthernetProvider {

constexpr std::size_t adapterRecordSize = 1252;

// Fills every field the record carries; name, mtu, portType and autoSense
// come from elsewhere and are left alone.
void decodeAdapterRecord(const unsigned char (&record)[adapterRecordSize], PnicDetails &details);

// Six hexadecimal pairs separated by colons; bytes the text does not supply
// stay zero.
void parseMacAddress(const char *text, std::size_t textLimit, uint8_t (&mac)[6]);

}  // namespace EthernetProvider

// The 1252-byte adapter record of node 72.
#pragma once

#include <cstddef>

#include "profile/AdapterProfile.h"

namespace hostsim {

constexpr std::size_t adapterRecordSize = 1252;

// `record` is adapterRecordSize zeroed bytes; bytes of no field stay zero.
void encodeAdapterRecord(const AdapterProfile &adapter, unsigned char *record);

}  // namespace hostsim

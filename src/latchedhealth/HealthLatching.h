// Latching one element's reported health into the records. The caller holds
// healthMutex.
#pragma once

#include <cstdint>

#include "CmpiObjectPath.h"

namespace TvLatchedHealth {

// For a value other than OK: escalates the element's record when the value
// is higher, or creates its record. An element whose path cannot be copied
// faithfully (no keys, a key that is not text, a text too long for its
// field, a host name beginning with "NULL") is dropped with a logged
// message; its event number stays consumed. Throws what the broker throws
// before a record has its first fields, which ends the poll of the class.
void latchElement(const CmpiObjectPath &element, std::uint16_t value);

}  // namespace TvLatchedHealth

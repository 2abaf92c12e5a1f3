// The CIM datetime text: "yyyymmddhhmmss.mmmmmm+ooo" for a point in time and
// "ddddddddhhmmss.mmmmmm:000" for an interval.
#pragma once

#include <string>

#include "model/CimValue.h"

namespace tvxbroker {

// Points in time are written in UTC. Throws std::out_of_range for a point
// after the year 9999 or an interval of more than 99999999 days.
std::string formatCimDateTime(const DateTime &value);

// Applies the UTC offset of a point in time. Returns false, leaving `value`
// untouched, for malformed text, wildcards and points before the epoch.
bool parseCimDateTime(const std::string &text, DateTime &value);

}  // namespace tvxbroker

// Where both ways of catching syslog hand over a line.
#pragma once

#include <cstdarg>

namespace syslogcapture {

void capture(int priority, const char *format, va_list args);

}  // namespace syslogcapture

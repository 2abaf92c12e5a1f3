// Calls of the test's own objects and static libraries, redirected here by
// the linker (--wrap=syslog).
#include "SyslogCapture.h"

extern "C" void __wrap_syslog(int priority, const char *format, ...) {
    va_list args;
    va_start(args, format);
    syslogcapture::capture(priority, format, args);
    va_end(args);
}

// syslog itself, exported from the test executable: the dynamic loader binds
// the calls of every library loaded later (a provider library the embedded
// broker opens) to this definition before the C library's.
#include <syslog.h>

#include "SyslogCapture.h"

extern "C" __attribute__((visibility("default"))) void syslog(int priority, const char *format, ...) {
    va_list args;
    va_start(args, format);
    syslogcapture::capture(priority, format, args);
    va_end(args);
}

// The lines the code under test has logged through syslog, with their
// priorities, in the order they were logged (from any thread). Nothing
// reaches the system log meanwhile.
#pragma once

#include <cstdarg>
#include <ostream>
#include <string>
#include <vector>

namespace syslogcapture {

struct LoggedLine {
    int priority;
    std::string text;  // formatted, trailing line feed and all

    bool operator==(const LoggedLine &other) const {
        return priority == other.priority && text == other.text;
    }
};

// Everything logged since the previous call, which it forgets.
std::vector<LoggedLine> takeLoggedLines();

void PrintTo(const LoggedLine &line, std::ostream *os);

// Where both ways of catching syslog hand over a line.
void capture(int priority, const char *format, va_list args);

}  // namespace syslogcapture

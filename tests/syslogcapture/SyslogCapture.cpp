#include "SyslogCapture.h"

#include <syslog.h>

#include <cstdio>
#include <mutex>
#include <utility>

namespace syslogcapture {
namespace {

std::mutex loggedMutex;
std::vector<LoggedLine> logged;

}  // namespace

std::vector<LoggedLine> takeLoggedLines() {
    const std::lock_guard<std::mutex> lock(loggedMutex);
    return std::exchange(logged, {});
}

void PrintTo(const LoggedLine &line, std::ostream *os) {
    *os << "{priority " << line.priority << ", \"";
    for (char c : line.text) *os << (c == '\n' ? std::string("\\n") : std::string(1, c));
    *os << "\"}";
}

void capture(int priority, const char *format, va_list args) {
    va_list measuring;
    va_copy(measuring, args);
    const int length = std::vsnprintf(nullptr, 0, format, measuring);
    va_end(measuring);
    std::string text(length > 0 ? static_cast<std::size_t>(length) : 0, '\0');
    std::vsnprintf(text.data(), text.size() + 1, format, args);
    const std::lock_guard<std::mutex> lock(loggedMutex);
    logged.push_back({priority, text});
}

}  // namespace syslogcapture


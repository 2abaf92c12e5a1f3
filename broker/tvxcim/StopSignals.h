// SIGINT and SIGTERM held back while a command waits, so that either ends
// the wait as a deadline does and the broker still shuts down in order.
#pragma once

#include <signal.h>

#include <optional>

namespace tvxcim {

class StopSignals {
public:
    // Blocks both in the calling thread and in every thread it starts from
    // now on; make it before the broker starts provider threads.
    StopSignals();
    ~StopSignals();  // the calling thread's previous signal mask again
    StopSignals(const StopSignals &) = delete;
    StopSignals &operator=(const StopSignals &) = delete;

    // Returns when one of the signals arrives or, when `seconds` is given,
    // once that many seconds have passed.
    void wait(std::optional<double> seconds) const;

private:
    sigset_t stopping{};
    sigset_t previous{};
};

}  // namespace tvxcim

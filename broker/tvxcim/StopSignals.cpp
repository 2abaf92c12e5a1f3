#include "tvxcim/StopSignals.h"

#include <pthread.h>

#include <chrono>

namespace tvxcim {

StopSignals::StopSignals() {
    sigemptyset(&stopping);
    sigaddset(&stopping, SIGINT);
    sigaddset(&stopping, SIGTERM);
    pthread_sigmask(SIG_BLOCK, &stopping, &previous);
}

StopSignals::~StopSignals() { pthread_sigmask(SIG_SETMASK, &previous, nullptr); }

void StopSignals::wait(std::optional<double> seconds) const {
    using Clock = std::chrono::steady_clock;
    const Clock::time_point deadline =
        Clock::now() +
        std::chrono::duration_cast<Clock::duration>(std::chrono::duration<double>(seconds.value_or(0)));
    for (;;) {
        timespec timeout{};
        if (seconds) {
            const auto left = std::chrono::duration_cast<std::chrono::nanoseconds>(deadline - Clock::now());
            if (left.count() <= 0) return;
            timeout.tv_sec = static_cast<time_t>(left.count() / 1000000000);
            timeout.tv_nsec = static_cast<long>(left.count() % 1000000000);
        }
        // Anything but a stopping signal (a timeout, another signal's handler) leads back to the deadline.
        if (sigtimedwait(&stopping, nullptr, seconds ? &timeout : nullptr) > 0) return;
    }
}

}  // namespace tvxcim

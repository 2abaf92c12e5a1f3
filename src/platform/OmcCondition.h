// A POSIX condition variable with default attributes (so deadlines are on
// CLOCK_REALTIME, the clock of gettimeofday), owned by one object. Waits can
// end without a signal: callers re-test their own state after every wait.
#pragma once

#include <pthread.h>

#include <ctime>

#include "platform/OmcMutex.h"

namespace OMC {

class Condition {
public:
    Condition();  // throws std::system_error when the condition cannot be created
    ~Condition();
    Condition(const Condition &) = delete;
    Condition &operator=(const Condition &) = delete;

    // The caller holds `mutex`; it is released during the wait and held
    // again on return. Both throw std::system_error on failure, for
    // instance for a deadline whose nanoseconds are out of range.
    void wait(Mutex &mutex);
    // True when the absolute `deadline` passed before a wake-up.
    bool timedWait(Mutex &mutex, const timespec &deadline);

    void signal();
    void broadcast();

private:
    pthread_cond_t condition;
};

}  // namespace OMC

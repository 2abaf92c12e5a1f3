// The mutex and condition as the provider threads use them: a periodic wait
// on an absolute time-of-day deadline that either runs out or is cut short
// by a broadcast. Under ThreadSanitizer the broadcast case also proves that
// the lock guard excludes.
#include <gtest/gtest.h>

#include <sys/time.h>

#include <chrono>
#include <system_error>
#include <thread>
#include <vector>

#include "platform/OmcCondition.h"

namespace {

timespec timeOfDayPlus(std::chrono::milliseconds delay) {
    timeval now{};
    gettimeofday(&now, nullptr);
    const auto at = std::chrono::seconds(now.tv_sec) + std::chrono::microseconds(now.tv_usec) + delay;
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(at);
    timespec deadline{};
    deadline.tv_sec = static_cast<time_t>(seconds.count());
    deadline.tv_nsec = static_cast<long>(std::chrono::nanoseconds(at - seconds).count());
    return deadline;
}

TEST(OmcCondition, TimedWaitReportsAPassedDeadline) {
    OMC::Mutex mutex;
    OMC::Condition condition;
    const OMC::MutexLock lock(mutex);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_TRUE(condition.timedWait(mutex, timeOfDayPlus(std::chrono::milliseconds(0))));
    // Waits may end early without a signal, so only the outcome of the
    // deadline is certain: keep waiting until it is reported.
    while (!condition.timedWait(mutex, timeOfDayPlus(std::chrono::milliseconds(20)))) {
    }
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(20));
}

TEST(OmcCondition, BroadcastWakesEveryWaiterLongBeforeItsDeadline) {
    OMC::Mutex mutex;
    OMC::Condition condition;
    OMC::Condition ready;
    bool stop = false;
    int waiting = 0;
    int timedOut = 0;
    std::vector<std::thread> waiters;
    for (int i = 0; i < 3; ++i) {
        waiters.emplace_back([&] {
            const OMC::MutexLock lock(mutex);
            ++waiting;
            ready.signal();
            const timespec deadline = timeOfDayPlus(std::chrono::seconds(60));
            while (!stop) {
                if (condition.timedWait(mutex, deadline)) ++timedOut;
            }
        });
    }
    {
        const OMC::MutexLock lock(mutex);
        while (waiting < 3) ready.wait(mutex);
        stop = true;
        condition.broadcast();
    }
    for (std::thread &waiter : waiters) waiter.join();
    EXPECT_EQ(timedOut, 0);
}

TEST(OmcCondition, ADeadlineOutOfRangeIsAnError) {
    OMC::Mutex mutex;
    OMC::Condition condition;
    const OMC::MutexLock lock(mutex);
    timespec deadline = timeOfDayPlus(std::chrono::milliseconds(0));
    deadline.tv_nsec = 1000000000;
    EXPECT_THROW(condition.timedWait(mutex, deadline), std::system_error);
}

}  // namespace

// The wait between a provider thread's cycles: its deadline, the period
// after the time of day to the microsecond and never wrapped into the past
// by a period longer than time_t has room for, and the condition's wait on
// such a deadline running out. A broadcast cutting it short shows in the
// tests of the threads that wait.
#include <gtest/gtest.h>

#include <chrono>
#include <climits>
#include <limits>
#include <system_error>

#include "platform/OmcCondition.h"
#include "platform/ProviderThread.h"

namespace {

using namespace std::chrono_literals;

TEST(ProviderThreadDeadline, IsThePeriodAfterNowAndStopsAtTheLastSecondTimeHolds) {
    constexpr time_t latest = std::numeric_limits<time_t>::max();
    const struct {
        timeval now;
        int seconds;
        time_t expectedSeconds;
        long expectedNanoseconds;
    } cases[] = {
        {{1000, 999999}, 300, 1300, 999999000},
        {{latest - 30, 0}, 30, latest, 0},
        {{latest - 10, 5}, 30, latest, 5000},
        {{latest - 100, 0}, INT_MAX, latest, 0},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(testing::Message() << c.now.tv_sec << "s " << c.now.tv_usec << "us + " << c.seconds << "s");
        const timespec deadline = platform::deadlineAfter(c.now, c.seconds);
        EXPECT_EQ(deadline.tv_sec, c.expectedSeconds);
        EXPECT_EQ(deadline.tv_nsec, c.expectedNanoseconds);
    }
}

// On the clock of gettimeofday, which system_clock reads.
timespec timeOfDayPlus(std::chrono::milliseconds delay) {
    const auto at = std::chrono::system_clock::now().time_since_epoch() + delay;
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(at);
    timespec deadline{};
    deadline.tv_sec = static_cast<time_t>(seconds.count());
    deadline.tv_nsec = static_cast<long>(std::chrono::nanoseconds(at - seconds).count());
    return deadline;
}

TEST(OmcCondition, TimedWaitReportsAPassedDeadlineAndRefusesAnInvalidOne) {
    OMC::Mutex mutex;
    OMC::Condition condition;
    const OMC::MutexLock lock(mutex);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_TRUE(condition.timedWait(mutex, timeOfDayPlus(0ms)));
    // Waits may end early without a signal, so only the outcome of the
    // deadline is certain: keep waiting until it is reported.
    while (!condition.timedWait(mutex, timeOfDayPlus(20ms))) {
    }
    EXPECT_GE(std::chrono::steady_clock::now() - start, 20ms);
    timespec outOfRange = timeOfDayPlus(0ms);
    outOfRange.tv_nsec = 1000000000;
    EXPECT_THROW(condition.timedWait(mutex, outOfRange), std::system_error);
}

}  // namespace

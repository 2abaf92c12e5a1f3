// The deadline of the wait between a provider thread's cycles: the period
// after the time of day to the microsecond, never wrapped into the past by
// a period longer than time_t has room for. A broadcast cutting the wait
// short shows in the tests of the threads that wait.
#include <gtest/gtest.h>

#include <climits>
#include <limits>

#include "platform/ProviderThread.h"

namespace {

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

}  // namespace

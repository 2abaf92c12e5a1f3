// The deadline a provider thread waits for between cycles: the period after
// the time of day, to the microsecond, and never wrapped into the past by a
// period longer than time_t has room for.
#include <gtest/gtest.h>

#include <climits>
#include <limits>

#include "platform/ProviderThread.h"

namespace {

constexpr time_t kLatest = std::numeric_limits<time_t>::max();

struct DeadlineCase {
    timeval now;
    int seconds;
    time_t expectedSeconds;
    long expectedNanoseconds;
};

TEST(ProviderThreadDeadline, IsThePeriodAfterNowAndStopsAtTheLastSecondTimeHolds) {
    const DeadlineCase cases[] = {
        {{1000, 250}, 30, 1030, 250000},
        {{1000, 999999}, 300, 1300, 999999000},
        {{kLatest - 30, 0}, 30, kLatest, 0},
        {{kLatest - 10, 5}, 30, kLatest, 5000},
        {{kLatest - 100, 0}, INT_MAX, kLatest, 0},
    };
    for (const DeadlineCase &c : cases) {
        SCOPED_TRACE(testing::Message() << c.now.tv_sec << "s " << c.now.tv_usec << "us + " << c.seconds << "s");
        const timespec deadline = platform::deadlineAfter(c.now, c.seconds);
        EXPECT_EQ(deadline.tv_sec, c.expectedSeconds);
        EXPECT_EQ(deadline.tv_nsec, c.expectedNanoseconds);
    }
}

}  // namespace

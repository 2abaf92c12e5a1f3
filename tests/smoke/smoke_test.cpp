#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/utsname.h>

#include <climits>
#include <cstddef>
#include <cstdlib>
#include <string>
#include <thread>

namespace {

TEST(Smoke, PointerWidthMatchesTargetArchitecture) {
  EXPECT_EQ(sizeof(void*), static_cast<std::size_t>(TVX_SMOKE_POINTER_BYTES));
}

// qemu-user answers uname with the guest CPU, so this tells which machine
// really executed the test, not just what it was compiled for.
TEST(Smoke, RunningMachineMatchesTargetArchitecture) {
  utsname info{};
  ASSERT_EQ(uname(&info), 0);
  EXPECT_THAT(std::string(info.machine), ::testing::MatchesRegex(TVX_SMOKE_MACHINE_REGEX));
}

#if TVX_SMOKE_EXPECT_ASAN
TEST(SmokeDeathTest, AddressSanitizerStopsHeapOverflow) {
  const auto write_past_end = [] {
    char* block = new char[4];
    volatile std::size_t index = 4;
    block[index] = 1;
    delete[] block;
  };
  EXPECT_DEATH(write_past_end(), "heap-buffer-overflow");
}
#endif

#if TVX_SMOKE_EXPECT_UBSAN
int add(int a, int b) { return a + b; }

TEST(SmokeDeathTest, UndefinedSanitizerStopsSignedOverflow) {
  volatile int largest = INT_MAX;
  EXPECT_DEATH(static_cast<void>(add(largest, 1)), "signed integer overflow");
}
#endif

#if TVX_SMOKE_EXPECT_TSAN
// ThreadSanitizer exits with 66 after a report, whether it halts at once or
// at exit.
TEST(SmokeDeathTest, ThreadSanitizerReportsDataRace) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  int counter = 0;
  const auto race = [&counter] {
    std::thread first([&counter] { ++counter; });
    std::thread second([&counter] { ++counter; });
    first.join();
    second.join();
    std::exit(0);
  };
  EXPECT_EXIT(race(), ::testing::ExitedWithCode(66), "data race");
}
#endif

}  // namespace

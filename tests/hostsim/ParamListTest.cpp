#include <cstdint>
#include <tuple>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

using HostSimParamLists = HostSimTest;

// Strict about types and indexes, as the real library is: an instance number
// past 32 bits is refused rather than cut, and a failed read clears its output.
TEST_F(HostSimParamLists, EntriesReadBackByTheirType) {
    const List list = listOf({"vmk0", INT64_C(1) << 40, int64_t(INT32_MIN)});
    // index, PRB_ParamListGetString status and text, PRB_ParamListGetInt32 status and value
    const std::tuple<int, int, const char *, int, int32_t> reads[] = {
        {0, HOSTSIM_STATUS_OK, "vmk0", HOSTSIM_STATUS_WRONG_TYPE, 0},
        {1, HOSTSIM_STATUS_WRONG_TYPE, nullptr, HOSTSIM_STATUS_WRONG_TYPE, 0},
        {2, HOSTSIM_STATUS_WRONG_TYPE, nullptr, HOSTSIM_STATUS_OK, INT32_MIN},
        {3, HOSTSIM_STATUS_NOT_FOUND, nullptr, HOSTSIM_STATUS_NOT_FOUND, 0},
    };
    for (const auto &[index, stringStatus, text, int32Status, value] : reads) {
        char sentinel = 0;
        char *gotText = &sentinel;
        int32_t gotValue = 77;
        EXPECT_EQ(PRB_ParamListGetString(list.get(), index, &gotText), stringStatus) << index;
        EXPECT_STREQ(gotText, text) << index;
        EXPECT_EQ(PRB_ParamListGetInt32(list.get(), index, &gotValue), int32Status) << index;
        EXPECT_EQ(gotValue, value) << index;
        EXPECT_EQ(PRB_ParamGetString(PRB_ParamListGetParam(list.get(), index)), gotText) << index;
    }
}

}  // namespace
}  // namespace hostsim_test

// The user library's version record, byte for byte: the provider reads it
// through the header's struct, so this is what pins the struct to the
// library's layout. The software tests cover a failing query end to end.
#include <cstring>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

std::string textAt(const Bytes &record, std::size_t offset, std::size_t width) {
    const auto *start = reinterpret_cast<const char *>(record.data() + offset);
    return std::string(start, ::strnlen(start, width));
}

using HostSimSystemVersion = HostSimTest;

TEST_F(HostSimSystemVersion, TheRecordAtItsOffsetsWithFullWidthTexts) {
    serve({{"hostType", "Corla"},
           {"systemVersion", {{"productName", std::string(31, 'p')}, {"versionText", ""}, {"infoText", "i"},
                              {"releaseDate", std::string(63, 'd')}, {"buildNumber", -2}}}});
    // Read as bytes, so that the offsets are checked and not the struct.
    SystemVersionInfo info;
    std::memset(&info, 0xee, sizeof info);
    ASSERT_EQ(OskuserVersion_GetSystemVersion(&info), 0);
    Bytes record(sizeof info);
    std::memcpy(record.data(), &info, sizeof info);
    EXPECT_EQ(textAt(record, 0, 32), std::string(31, 'p'));
    EXPECT_EQ(textAt(record, 32, 32), "");
    EXPECT_EQ(textAt(record, 64, 32), "i");
    EXPECT_EQ(textAt(record, 96, 64), std::string(63, 'd'));
    EXPECT_EQ(record[31] | record[63] | record[95] | record[159], 0) << "a field without its terminator";
    EXPECT_EQ(record[160] | record[161] << 8 | record[162] << 16 | std::uint32_t(record[163]) << 24, 0xfffffffe);
}

}  // namespace
}  // namespace hostsim_test

// The user library's version query: the record's bytes at their offsets
// and, when the query fails, the record left alone and a status that
// explains itself. The provider's tests read the usual statuses.
#include <cerrno>
#include <cstring>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

// The record as bytes, so the offsets are checked and not the struct.
Bytes queriedRecord(int *status) {
    Bytes record(sizeof(SystemVersionInfo), 0xee);
    SystemVersionInfo info;
    std::memcpy(&info, record.data(), record.size());
    *status = OskuserVersion_GetSystemVersion(&info);
    std::memcpy(record.data(), &info, record.size());
    return record;
}

std::string textAt(const Bytes &record, std::size_t offset, std::size_t width) {
    const auto *start = reinterpret_cast<const char *>(record.data() + offset);
    return std::string(start, ::strnlen(start, width));
}

using HostSimSystemVersion = HostSimTest;

TEST_F(HostSimSystemVersion, TheRecordAtItsOffsetsWithFullWidthTexts) {
    serve({{"hostType", "Corla"},
           {"systemVersion", {{"productName", std::string(31, 'p')}, {"versionText", ""}, {"infoText", "i"},
                              {"releaseDate", std::string(63, 'd')}, {"buildNumber", -2}}}});
    int status = -1;
    const Bytes record = queriedRecord(&status);
    ASSERT_EQ(status, 0);
    EXPECT_EQ(textAt(record, 0, 32), std::string(31, 'p'));
    EXPECT_EQ(textAt(record, 32, 32), "");
    EXPECT_EQ(textAt(record, 64, 32), "i");
    EXPECT_EQ(textAt(record, 96, 64), std::string(63, 'd'));
    EXPECT_EQ(record[31] | record[63] | record[95] | record[159], 0) << "a field without its terminator";
    EXPECT_EQ(record[160] | record[161] << 8 | record[162] << 16 | std::uint32_t(record[163]) << 24, 0xfffffffe);
}

TEST_F(HostSimSystemVersion, AFailingQueryLeavesTheRecordAndItsStatusExplainsItself) {
    serve(host({}, {{{"call", "OskuserVersion_GetSystemVersion"}, {"status", 99}}}));
    int status = 0;
    EXPECT_EQ(queriedRecord(&status), Bytes(sizeof(SystemVersionInfo), 0xee));
    EXPECT_EQ(status, 99);
    int errnoValue = -1;
    EXPECT_EQ(OskuserStatus_CodeToErrno(status, &errnoValue), 0);
    EXPECT_EQ(errnoValue, EIO);
    char text[1024];
    EXPECT_EQ(OskuserStatus_CodeToString(status, text, sizeof text, 0), 0);
    EXPECT_STREQ(text, "Unknown status 99");
    char shortBuffer[5];
    EXPECT_EQ(OskuserStatus_CodeToString(HOSTSIM_STATUS_NOT_FOUND, shortBuffer, sizeof shortBuffer, 0), 0);
    EXPECT_STREQ(shortBuffer, "Not ");
    EXPECT_NE(OskuserStatus_CodeToString(0, shortBuffer, sizeof shortBuffer, 1), 0);
    EXPECT_NE(OskuserStatus_CodeToString(0, nullptr, 8, 0), 0);
    EXPECT_NE(OskuserStatus_CodeToErrno(0, nullptr), 0);
    EXPECT_NE(OskuserVersion_GetSystemVersion(nullptr), 0);
}

}  // namespace
}  // namespace hostsim_test

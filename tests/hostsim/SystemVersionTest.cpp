// The user library's version query and its status texts: the record's
// bytes at their offsets, the defaults, the profile's refusals
// and a failing query with the status its fault chose.
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

TEST_F(HostSimSystemVersion, TheRecordAtItsOffsets) {
    const struct {
        nlohmann::json profile;
        const char *product, *version, *info, *date;
        std::uint32_t build;
    } cases[] = {
        {{{"hostType", "Corlai"}}, "Talvex Corlai", "5.1.0", "releasebuild-1483097", "Jul 12 2012", 1483097},
        {{{"hostType", "Corla"},
          {"systemVersion", {{"productName", std::string(31, 'p')}, {"versionText", ""}, {"infoText", "i"},
                             {"releaseDate", std::string(63, 'd')}, {"buildNumber", -2}}}},
         "ppppppppppppppppppppppppppppppp", "", "i", "", 0xfffffffe},
    };
    for (const auto &c : cases) {
        serve(c.profile);
        int status = -1;
        const Bytes record = queriedRecord(&status);
        ASSERT_EQ(status, 0) << c.profile;
        EXPECT_EQ(textAt(record, 0, 32), c.product);
        EXPECT_EQ(textAt(record, 32, 32), c.version);
        EXPECT_EQ(textAt(record, 64, 32), c.info);
        EXPECT_EQ(textAt(record, 96, 64), *c.date ? c.date : std::string(63, 'd'));
        EXPECT_EQ(record[31] | record[63] | record[95] | record[159], 0) << "a field without its terminator";
        EXPECT_EQ(record[160] | record[161] << 8 | record[162] << 16 | std::uint32_t(record[163]) << 24, c.build);
    }
}

TEST_F(HostSimSystemVersion, WhatTheRecordCannotHoldIsRefused) {
    const std::pair<std::string, std::string> cases[] = {
        {R"("systemVersion": {"productName": ")" + std::string(32, 'p') + "\"}",
         "systemVersion.productName: expected a text of at most 31 bytes"},
        {R"("systemVersion": {"releaseDate": ")" + std::string(64, 'd') + "\"}",
         "systemVersion.releaseDate: expected a text of at most 63 bytes"},
        {R"("faults": [{"call": "OskuserVersion_GetSystemVersion", "status": 0}])", "faults[0].status: expected"},
    };
    for (const auto &[field, error] : cases) {
        EXPECT_EQ(loadError(R"({"hostType": "Corlai", )" + field + "}").rfind(error, 0), 0u) << field;
    }
}

TEST_F(HostSimSystemVersion, AFailingQueryLeavesTheRecordAndItsStatusExplainsItself) {
    const struct {
        nlohmann::json rule;
        int status, errnoValue;
        const char *text;
    } cases[] = {
        {{{"call", "OskuserVersion_GetSystemVersion"}}, HOSTSIM_STATUS_INJECTED, EIO,
         "Failure injected by the host profile"},
        {{{"call", "OskuserVersion_GetSystemVersion"}, {"status", 5}}, 5, ENOENT, "Not found"},
        {{{"call", "OskuserVersion_GetSystemVersion"}, {"status", 99}}, 99, EIO, "Unknown status 99"},
    };
    for (const auto &c : cases) {
        serve(host({}, {c.rule}));
        int status = 0;
        EXPECT_EQ(queriedRecord(&status), Bytes(sizeof(SystemVersionInfo), 0xee));
        EXPECT_EQ(status, c.status);
        int errnoValue = -1;
        EXPECT_EQ(OskuserStatus_CodeToErrno(status, &errnoValue), 0);
        EXPECT_EQ(errnoValue, c.errnoValue);
        char text[1024];
        EXPECT_EQ(OskuserStatus_CodeToString(status, text, sizeof text, 0), 0);
        EXPECT_STREQ(text, c.text);
    }
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

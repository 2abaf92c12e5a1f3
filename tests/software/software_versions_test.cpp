// Where the two images' versions come from, linked in: the boot-bank
// reader over files the tests write, the version query of the stand-in
// host with its faults (every syslog line caught), the identity text and
// the release date.
#include <gtest/gtest.h>
#include <syslog.h>

#include "SoftwareTesting.h"
#include "SyslogCapture.h"
#include "hostsim/HostSimControl.h"
#include "software/BootBank.h"
#include "software/HypervisorVersions.h"
#include "software/InstanceId.h"
#include "software/SoftwareIdentity.h"

namespace {

using namespace Software;
using softwaretest::BootBankFile;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

void serve(const std::string &profile) {
    char error[256];
    ASSERT_EQ(HostSim_LoadProfileText(profile.c_str(), error, sizeof error), 0) << error;
}

// The number itself, or the third of three; anything else is -1.
TEST(BootBank, BuildNumbers) {
    const std::pair<std::string, std::int32_t> cases[] = {
        {"0.0.654321", 654321}, {"0", 0}, {"2147483647", 2147483647}, {"0654321", -1}, {"+654321", -1},
        {"1.2", -1}, {"1.2.3.4", -1}, {"1..3", -1}, {"", -1}, {"2147483648", -1}, {std::string(100000, '1'), -1},
    };
    for (const auto &[text, build] : cases) EXPECT_EQ(buildNumberOf(text), build) << text.substr(0, 20);
}

TEST(BootBank, EveryShapeOfTheBuildLine) {
    const struct {
        std::string content;
        const char *version;  // null: the all-zero record
        std::int32_t build;
    } cases[] = {
        {"build=5.1.0-654321  \t\r\n", "5.1.0", 654321},
        {"build=" + std::string(40, '7') + "-42\n", "7777777777777777777777777777777", 42},
        {"build=5.1.0\n", nullptr, 0},
        {" build=5.1.0-1\nBUILD=5.1.0-2\n", nullptr, 0},
        {std::string(100000, 'x') + "\nbuild=5.1.0-3\nbuild=6.0.0-22\n", "5.1.0", 3},
        {std::string("build=5.1\0.0-4\n", 15), nullptr, 0},
    };
    const BootBankFile file("");
    for (const auto &c : cases) {
        file.write(c.content);
        const std::unique_ptr<SystemVersionInfo> record = readBootBank(file.path.c_str());
        ASSERT_NE(record, nullptr);
        const std::string shown = c.content.substr(0, 40);
        EXPECT_EQ(fieldText(record->versionText), c.version ? c.version : "") << shown;
        EXPECT_EQ(fieldText(record->productName), c.version ? "Talvex Corlai" : "") << shown;
        EXPECT_EQ(record->buildNumber, c.build) << shown;
    }
    EXPECT_EQ(readBootBank((file.path + ".absent").c_str()), nullptr);
}

// Only the exact prefix marks the alternate image; a key that is no text
// reaches here as null.
TEST(InstanceId, OnlyTheExactPrefixMarksTheAlternateImage) {
    EXPECT_TRUE(isAltBootBankId("Alt Boot Bank: x"));
    EXPECT_FALSE(isAltBootBankId("alt boot bank: x"));
    EXPECT_FALSE(isAltBootBankId(nullptr));
}

class VersionSource : public testing::Test {
protected:
    void SetUp() override { takeLoggedLines(); }
    void TearDown() override { HostSim_ResetProfile(); }
    BootBankFile bootCfg{""};
};

// Each failing request logs, and a failure after a success keeps none of
// the earlier answer's texts.
TEST_F(VersionSource, AFailingQueryLogsEachTimeAndLeavesOnlyTheDefaults) {
    HypervisorVersions versions(bootCfg.path);
    serve(R"({"hostType": "Corlai", "systemVersion": {"productName": "P", "versionText": "6.7.8",
              "infoText": "info", "releaseDate": "Mar 3 2020", "buildNumber": -1}})");
    versions.gatherVersions();
    EXPECT_EQ(makeInstanceId(versions.running()), "P 6.7.8 build-4294967295");
    EXPECT_STREQ(versions.running().releaseDateText, "Mar 3 2020");
    EXPECT_TRUE(takeLoggedLines().empty());
    serve(R"({"hostType": "Corlai", "faults": [{"call": "OskuserVersion_GetSystemVersion"}]})");
    for (int request = 0; request < 2; ++request) {
        versions.gatherVersions();
        EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, "Got error from OskuserVersion_GetSystemVersion "
                                                                         "(5): Failure injected by the host profile\n"}}));
    }
    EXPECT_EQ(makeInstanceId(versions.running()), "Talvex Corlai 5.1.0 build-1483097");
    EXPECT_STREQ(versions.running().infoText, "version query failed");
    EXPECT_STREQ(versions.running().releaseDateText, "");
}

TEST(ReleaseDate, MonthWordsAndDates) {
    const std::pair<const char *, int> months[] = {
        {"Mar", 2}, {"Apr", 3}, {"May", 4}, {"Jun", 5}, {"JUL", 6}, {"AuG", 7}, {"Dec", 11},
        {"jul", 0}, {"Ju", 0}, {"Max", 0}, {"A", 0}, {"", 0},
    };
    for (const auto &[word, month] : months) EXPECT_EQ(monthOfWord(word), month) << word;

    // A word that is no month counts as January (the provider tests').
    ASSERT_NE(releaseDateMicros("Mar 1 2012"), std::nullopt);
    EXPECT_EQ(releaseDateMicros("Feb 30 2012"), releaseDateMicros("Mar 1 2012"));
    for (const char *unparsed : {"", "Jul", "Jul 12", "Jul x 2012", "12 Jul 2012 x", "Jul 12 1950", "Jul 12 10000"}) {
        EXPECT_EQ(releaseDateMicros(unparsed), std::nullopt) << unparsed;
    }
}

}  // namespace

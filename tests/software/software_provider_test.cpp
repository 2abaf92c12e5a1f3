// Talvex_HypervisorSoftwareIdentity through the embedded broker and the
// shipped library, which logs into this test (it exports syslog): the two
// images as clients see them, and the answers and log lines for another
// class and an unknown image.
#include <syslog.h>

#include <ctime>
#include <functional>

#include "ProductBroker.h"
#include "SoftwareTesting.h"
#include "SyslogCapture.h"

namespace {

using namespace producttest;
using softwaretest::kAltId;
using softwaretest::kRunningId;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

constexpr const char *kClass = "Talvex_HypervisorSoftwareIdentity";
constexpr const char *kUnserved = "Test_UnservedSoftware";

std::string host(const char *type, const std::string &systemVersion = "{}") {
    return std::string(R"({"hostType": ")") + type + R"(", "systemVersion": )" + systemVersion + "}";
}

ObjectPath imagePath(const std::string &instanceId, const char *cls = kClass) {
    return ObjectPath{"", kNs, cls, {{"InstanceID", CimValue::makeString(instanceId)}}};
}

class SoftwareProvider : public ProductBroker {
protected:
    SoftwareProvider() : ProductBroker(kClass, kUnserved) {}

    void SetUp() override {
        ProductBroker::SetUp();
        takeLoggedLines();
    }

    softwaretest::BootBankFile bootCfg{"build=5.1.0-0.0.654321\n"};
};

TEST_F(SoftwareProvider, AnotherClassIsLoggedAndNotSupportedByEveryOperation) {
    serve(host("Corlai"));
    const struct {
        std::function<Response()> request;
        std::string logged;
    } cases[] = {
        {[&] { return broker->enumInstanceNames(classPath(kUnserved)); },
         "Talvex_HypervisorSoftwareIdentityProvider::enumInstanceNames was for Test_UnservedSoftware, not the "
         "One True Class, Talvex_HypervisorSoftwareIdentity."},
        {[&] { return broker->enumInstances(classPath(kUnserved), {}); },
         "ERR: Talvex_HypervisorSoftwareIdentityProvider::enumInstances::Throwing not supported error!!!!!"},
        {[&] { return broker->getInstance(imagePath(kRunningId, kUnserved), {}); },
         "Talvex_HypervisorSoftwareIdentityProvider::getInstance was for Test_UnservedSoftware, not the One "
         "True Class, Talvex_HypervisorSoftwareIdentity."},
    };
    for (const auto &c : cases) {
        const Response response = c.request();
        EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_SUPPORTED) << c.logged;
        EXPECT_FALSE(response.message.has_value()) << c.logged;
        EXPECT_TRUE(response.instances.empty() && response.paths.empty()) << c.logged;
        EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, c.logged}}));
    }
}

TEST_F(SoftwareProvider, BothImagesOnACorlaiHostAndOnlyTheRunningOneOnACorlaHost) {
    const struct {
        const char *hostType;
        std::vector<std::string> ids;
    } cases[] = {
        // The provider keeps the boot bank it read last, so the host without
        // one comes first.
        {"Corla", {"Talvex Corla 5.1.0 build-1483097"}},
        {"Corlai", {kRunningId, kAltId}},
    };
    for (const auto &c : cases) {
        serve(host(c.hostType));
        const Response names = broker->enumInstanceNames(classPath(kClass));
        ASSERT_TRUE(names.ok());
        std::vector<std::string> ids;
        for (const ObjectPath &path : names.paths) ids.push_back(path.key("InstanceID")->text);
        EXPECT_EQ(ids, c.ids) << c.hostType;
    }
    // Only the exact InstanceID names an image.
    const std::string unknown = std::string(kAltId) + " ";
    EXPECT_EQ(broker->getInstance(imagePath(unknown), {}).rc, CMPI_RC_ERR_NOT_FOUND);
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, "Talvex_HypervisorSoftwareIdentityProvider::"
                                                                    "getInstance: Software instance not found with "
                                                                    "InstanceID = " + unknown}}));
}

TEST_F(SoftwareProvider, PropertiesOfTheRunningAndTheAlternateImage) {
    bootCfg.write("build=5.1-x\n");
    serve(host("Corlai", R"({"versionText": "6.5.4", "releaseDate": "jul 12 2012"})"));
    std::tm january{};
    january.tm_year = 112;
    january.tm_mday = 12;
    const std::time_t midnight = std::mktime(&january);
    char utc[32];
    std::strftime(utc, sizeof utc, "\"%Y%m%d%H%M%S.000000+000\"", std::gmtime(&midnight));

    const Response response = broker->enumInstances(classPath(kClass), {});
    ASSERT_EQ(response.instances.size(), 2u);
    const auto running = literals(response.instances[0]);
    const auto alternate = literals(response.instances[1]);
    EXPECT_EQ(running.at("ReleaseDate"), utc);
    EXPECT_EQ(running.count("LastStartTime"), 1u);
    EXPECT_EQ(running.at("MajorVersion"), "6");
    EXPECT_EQ(running.at("MinorVersion"), "5");
    EXPECT_EQ(running.at("RevisionNumber"), "4");
    EXPECT_EQ(alternate.at("LargeBuildNumber"), "4294967295");
    EXPECT_EQ(alternate.at("VersionString"), "\"5.1 build-4294967295\"");
    for (const char *absent : {"LastStartTime", "ReleaseDate", "MajorVersion", "MinorVersion", "RevisionNumber"}) {
        EXPECT_EQ(alternate.count(absent), 0u) << absent;
    }
}

}  // namespace

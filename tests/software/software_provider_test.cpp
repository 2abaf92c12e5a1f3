// The software identity and installed-software providers through the
// embedded broker and the shipped library, which logs into this test (it
// exports syslog): the images as clients see them, the answers and log
// lines for another class and an unknown image, and the association, whose
// software side comes from the software identity provider by up-calls and
// never includes the alternate boot bank's image. Both images and the one
// association of the default host are the demo's and the consistency
// suite's.
#include <syslog.h>

#include <ctime>
#include <functional>

#include "ProductBroker.h"
#include "SoftwareTesting.h"
#include "SyslogCapture.h"

namespace {

using namespace producttest;
using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

constexpr const char *kRunningId = "Talvex Corlai 5.1.0 build-1483097";
constexpr const char *kAltId = "Alt Boot Bank: Talvex Corlai 5.1.0 build-654321";
constexpr const char *kClass = "Talvex_HypervisorSoftwareIdentity";
constexpr const char *kUnserved = "Test_UnservedSoftware";
constexpr const char *kInstalled = "Talvex_InstalledSoftwareIdentity";
constexpr const char *kUnservedInstalled = "Test_UnservedInstalledSoftware";

std::string host(const char *type, const std::string &systemVersion = "{}") {
    return std::string(R"({"hostType": ")") + type + R"(", "systemVersion": )" + systemVersion + "}";
}

ObjectPath imagePath(const std::string &instanceId) {
    return ObjectPath{"", kNs, kClass, {{"InstanceID", CimValue::makeString(instanceId)}}};
}

class SoftwareProvider : public ProductBroker {
protected:
    SoftwareProvider(const char *served = kClass, const char *unserved = kUnserved) : ProductBroker(served, unserved) {}

    void SetUp() override {
        ProductBroker::SetUp();
        takeLoggedLines();
    }

    softwaretest::BootBankFile bootCfg{"build=5.1.0-0.0.654321\n"};
};

TEST_F(SoftwareProvider, AnotherClassIsLoggedAndNotSupported) {
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
    };
    for (const auto &c : cases) {
        const Response response = c.request();
        EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_SUPPORTED) << c.logged;
        EXPECT_FALSE(response.message.has_value()) << c.logged;
        EXPECT_TRUE(response.instances.empty() && response.paths.empty()) << c.logged;
        EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, c.logged}}));
    }
}

// Both images of the default host are the demo's; a Corla host has no
// alternate one, and only the exact InstanceID names an image.
TEST_F(SoftwareProvider, OnlyTheRunningImageOnACorlaHost) {
    serve(host("Corla"));
    const Response names = broker->enumInstanceNames(classPath(kClass));
    ASSERT_EQ(names.paths.size(), 1u) << names.rc;
    EXPECT_EQ(names.paths[0].key("InstanceID")->text, "Talvex Corla 5.1.0 build-1483097");
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

const ObjectPath &referenceOf(const ObjectPath &association, const char *role) {
    const CimValue *value = association.key(role);
    EXPECT_TRUE(value != nullptr && value->reference) << role;
    static const ObjectPath none;
    return value != nullptr && value->reference ? *value->reference : none;
}

class InstalledSoftware : public SoftwareProvider {
protected:
    InstalledSoftware() : SoftwareProvider(kInstalled, kUnservedInstalled) {}

    ObjectPath systemPath() const {
        return ObjectPath{"", kNs, "OMC_UnitaryComputerSystem",
                          {{"Name", CimValue::makeString(hostName)},
                           {"CreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")}}};
    }

    ObjectPath associationPath(const std::string &instanceId, const char *cls = kInstalled) const {
        return ObjectPath{"", kNs, cls,
                          {{"System", CimValue::makeReference(systemPath())},
                           {"InstalledSoftware", CimValue::makeReference(imagePath(instanceId))}}};
    }
};

// The answer depends only on whether the software provider knows the
// image, so the alternate one is found here; an unknown one passes on the
// broker's NOT_FOUND.
TEST_F(InstalledSoftware, GetInstanceAsksTheSoftwareProvider) {
    serve(host("Corlai"));
    const struct {
        std::string instanceId;
        const char *cls;
        CMPIrc rc;
    } cases[] = {
        {kRunningId, kInstalled, CMPI_RC_OK},
        {kAltId, kInstalled, CMPI_RC_OK},
        {"Talvex Corlai 5.1.0 build-1", kInstalled, CMPI_RC_ERR_NOT_FOUND},
        {kRunningId, kUnservedInstalled, CMPI_RC_ERR_NOT_FOUND},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(associationPath(c.instanceId, c.cls), {});
        EXPECT_EQ(response.rc, c.rc) << c.instanceId << " " << c.cls;
        ASSERT_EQ(response.instances.size(), c.rc == CMPI_RC_OK ? 1u : 0u);
        if (c.rc != CMPI_RC_OK) continue;
        const ObjectPath &path = response.instances[0].path;
        EXPECT_EQ(referenceOf(path, "InstalledSoftware").key("InstanceID")->text, c.instanceId);
        EXPECT_EQ(referenceOf(path, "System").nameSpace, "/root/cimv2");
    }
}

// Traversals reach the stand-in's real computer system and the software
// provider's real images; roles are compared without regard to case, and
// the alternate image is never installed software. Unfiltered traversals
// from both ends are the consistency suite's.
TEST_F(InstalledSoftware, TraversalsFromBothEnds) {
    serve(host("Corlai"));
    const ObjectPath system = systemPath();
    const struct {
        ObjectPath from;
        const char *resultClass, *role, *resultRole;
        const char *found;  // class of the one associator; null: none
    } cases[] = {
        {system, "CIM_SoftwareIdentity", "system", "INSTALLEDSOFTWARE", "Talvex_HypervisorSoftwareIdentity"},
        {system, "", "", "System", nullptr},
        {imagePath(kRunningId), "CIM_ComputerSystem", "installedsoftware", "SYSTEM", "OMC_UnitaryComputerSystem"},
        {imagePath(kAltId), "", "", "", nullptr},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(formatPath(c.from) + " " + c.resultClass + " " + c.role + " " + c.resultRole);
        const Response associators = broker->associators(c.from, kInstalled, c.resultClass, c.role, c.resultRole, {});
        ASSERT_TRUE(associators.ok()) << associators.rc;
        ASSERT_EQ(associators.instances.size(), c.found ? 1u : 0u);
        if (c.found) {
            EXPECT_EQ(associators.instances[0].path.className, c.found);
        }
    }
}

}  // namespace

// The latched-health providers linked into the test program and reached
// through the embedded broker, beside the stand-in host providers that serve
// the watched classes from a host profile given as text. The program's own
// factories (LinkedFactories.cpp) decide whether the providers start their
// threads; where they do not, a poll runs when the test says, through the
// function the health thread runs.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "CmpiBroker.h"
#include "core/Broker.h"
#include "hostsim/HostSimControl.h"
#include "latchedhealth/HealthInfo.h"
#include "latchedhealth/HealthMonitor.h"
#include "latchedhealth/LatchedHealthState.h"
#include "model/PathText.h"

namespace latchedtest {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";
// 80 characters: one more than a record keeps.
inline constexpr const char *kLongSensorClass =
    "Test_SensorWithAClassNameThatIsLongerThanWhatALatchedHealthRecordCanKeepInItsFld";

// One scripted element of the profile's watched elements, as JSON.
inline std::string element(const std::string &cls, const std::string &deviceId, const std::string &healthStates,
                           const std::string &extra = "") {
    return R"({"class": ")" + cls + R"(", "hostName": "esx1", "keys": [{"name": "CreationClassName", "value": ")" +
           cls + R"("}, {"name": "DeviceID", "value": ")" + deviceId + R"("}], "healthStates": )" +
           healthStates + extra + "}";
}

// A host profile serving `elements` (comma-separated JSON objects).
inline std::string profileWith(const std::string &elements) {
    return R"({"hostType": "Corlai", "watchedElements": [)" + elements + "]}";
}

class LatchedHealthBroker : public testing::Test {
protected:
    void SetUp() override { start(linkedInConfig()); }
    void TearDown() override {
        stop();
        EXPECT_EQ(HostSim_LiveListCount(), 0u);
        HostSim_ResetProfile();
    }

    // The product's and the stand-in's registrations, the latched-health
    // providers taken from the test program ("linkedin"), with a class of
    // the test's MOF that the instance provider does not serve and a sensor
    // class whose name does not fit a record.
    static BrokerConfig linkedInConfig() {
        BrokerConfig config = loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR},
                                               {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                               {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF, TVX_TEST_MOF});
        std::vector<ProviderRegistration> extra;
        for (ProviderRegistration &registration : config.registrations) {
            const std::string &provider = registration.providerName;
            if (provider == "Talvex_LatchedHealthState" || provider == "Talvex_LatchedHealthAssociation" ||
                provider == "Talvex_KernelIPChangedIndication") {
                registration.location = "linkedin";
            }
            ProviderRegistration added = registration;
            if (registration.className == "Talvex_LatchedHealthState") added.className = "Test_UnservedHealth";
            if (registration.className == "CIM_Sensor") added.className = kLongSensorClass;
            if (added.className != registration.className) extra.push_back(added);
        }
        config.registrations.insert(config.registrations.end(), extra.begin(), extra.end());
        config.inProcessLocations = {"linkedin"};
        return config;
    }

    void start(BrokerConfig config) {
        broker = std::make_unique<Broker>(std::move(config));
        const CmpiBroker mb(broker->cmpiBroker());
        threadContext = mb.prepareAttachThread(CmpiContext(broker->newContext(kNs)));
        mb.attachThread(threadContext);
    }

    void stop() {
        CmpiBroker(broker->cmpiBroker()).detachThread(threadContext);
        broker->shutdown();
    }

    static void serve(const std::string &profileJson) {
        char error[512];
        ASSERT_EQ(HostSim_LoadProfileText(profileJson.c_str(), error, sizeof error), 0) << error;
    }

    // One whole poll with the health thread's lock held, as the thread runs it.
    void poll() {
        const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
        TvLatchedHealth::pollWatchedClasses(CmpiBroker(broker->cmpiBroker()), threadContext);
    }

    // Copies, taken under the lock, of the records whose elements have this
    // DeviceID key, in list order.
    static std::vector<TvLatchedHealth::HealthInfo> recordsOf(const std::string &deviceId) {
        std::vector<TvLatchedHealth::HealthInfo> found;
        const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
        for (const auto &record : TvLatchedHealth::healthList) {
            for (const TvLatchedHealth::HealthKey &key : record->keys) {
                if (key.keyName == "DeviceID" && key.keyValue == deviceId) found.push_back(*record);
            }
        }
        return found;
    }
    static std::optional<TvLatchedHealth::HealthInfo> recordOf(const std::string &deviceId) {
        const auto found = recordsOf(deviceId);
        return found.empty() ? std::nullopt : std::optional(found.front());
    }
    static std::uint16_t rollup() { return TvLatchedHealth::rollupHealthState.load(); }

    static ObjectPath classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }
    static ObjectPath recordPath(const std::string &eventId, const std::string &cls = "Talvex_LatchedHealthState") {
        return ObjectPath{"", kNs, cls, {{"EventId", CimValue::makeString(eventId)}}};
    }

    std::unique_ptr<Broker> broker;
    CmpiContext threadContext;
};

}  // namespace latchedtest

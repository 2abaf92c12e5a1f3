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
    void TearDown() override;

    // The product's and the stand-in's registrations, the latched-health
    // providers taken from the test program.
    static BrokerConfig linkedInConfig();
    void start(BrokerConfig config);
    void stop();

    static void serve(const std::string &profileJson);
    // One whole poll with the health thread's lock held, as the thread runs it.
    void poll();
    // Copies, taken under the lock, of the records whose elements have this
    // DeviceID key, in list order.
    static std::vector<TvLatchedHealth::HealthInfo> recordsOf(const std::string &deviceId);
    static std::optional<TvLatchedHealth::HealthInfo> recordOf(const std::string &deviceId) {
        const auto found = recordsOf(deviceId);
        return found.empty() ? std::nullopt : std::optional(found.front());
    }
    static std::uint16_t rollup();

    static ObjectPath classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }
    static ObjectPath recordPath(const std::string &eventId, const std::string &cls = "Talvex_LatchedHealthState") {
        return ObjectPath{"", kNs, cls, {{"EventId", CimValue::makeString(eventId)}}};
    }

    std::unique_ptr<Broker> broker;
    CmpiContext threadContext;
};

}  // namespace latchedtest

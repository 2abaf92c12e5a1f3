// Latching over scripted polls: each case scripts the watched elements'
// health per poll and checks the records, the rollup and what was logged.
// Records live for the whole process, so every case names its own elements.
#include <gmock/gmock.h>
#include <syslog.h>

#include <algorithm>

#include "LatchedHealthBroker.h"
#include "SyslogCapture.h"

namespace latchedtest {
namespace {

using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;

LoggedLine dropped(const std::string &state, const std::string &cls) {
    return LoggedLine{LOG_ERR, "Failed to copy object, dropping health state " + state + " for " + cls + "\n"};
}

using LatchingTest = LatchedHealthBroker;

// An element stays latched at its worst state while the rollup follows the
// last poll; only an escalation takes a new event number.
TEST_F(LatchingTest, EscalatesOnlyUpwardsWithNewEventNumbers) {
    serve(profileWith(element("CIM_Sensor", "up", "[10, 5, 20]") + "," +
                      element("Talvex_DiskDrive", "down", "[20, 10]") + "," +
                      element("CIM_PowerSupply", "unknown", "[0, 5, 10]")));
    poll();
    const auto up = recordOf("up"), down = recordOf("down"), unknown = recordOf("unknown");
    ASSERT_TRUE(up && down && unknown);
    EXPECT_EQ(up->healthState, 10);
    EXPECT_EQ(unknown->healthState, 0);
    EXPECT_EQ(rollup(), 20);
    poll();
    EXPECT_EQ(recordOf("up")->eventId, up->eventId);
    EXPECT_EQ(recordOf("down")->eventId, down->eventId);
    EXPECT_EQ(recordOf("down")->healthState, 20);
    EXPECT_EQ(recordOf("unknown")->healthState, 0) << "5 is no escalation from unknown";
    EXPECT_EQ(rollup(), 10) << "the rollup is the worst of the last poll";
    poll();
    const auto escalated = recordOf("up");
    EXPECT_EQ(escalated->healthState, 20);
    EXPECT_GT(escalated->eventId, up->eventId);
    EXPECT_GE(escalated->timestamp, up->timestamp);
    EXPECT_EQ(recordOf("unknown")->healthState, 10);
    EXPECT_NE(recordOf("unknown")->eventId, escalated->eventId);
    EXPECT_EQ(escalated->hostName, std::string("esx1"));
    EXPECT_EQ(escalated->nameSpace, std::string(kNs));
}

// null, missing and wrongly typed HealthState values count nowhere; healthy
// elements count in the rollup only.
TEST_F(LatchingTest, HealthyIgnoredAndEmptyPolls) {
    serve(profileWith(element("Talvex_Battery", "ok", "[5]") + "," + element("CIM_Sensor", "null", "[null]") + "," +
                      element("CIM_Sensor", "missing", R"(["missing"])") + "," + element("CIM_Sensor", "text", R"(["25"])") +
                      "," + element("CIM_Sensor", "wide", "[70000]") + "," + element("CIM_Sensor", "flag", "[true]")));
    poll();
    EXPECT_EQ(rollup(), 5);
    for (const char *id : {"ok", "null", "missing", "text", "wide", "flag"}) EXPECT_FALSE(recordOf(id)) << id;
    serve(profileWith(""));
    poll();
    EXPECT_EQ(rollup(), 0);
}

// A record that would rebuild another path is dropped, not kept wrong, at
// every poll; a missing host name is recorded as "NULL".
TEST_F(LatchingTest, ElementsARecordCannotHoldAreDroppedEveryPoll) {
    serve(profileWith(R"({"class": "CIM_Sensor", "keys": [], "healthStates": [10]},)"
                      R"({"class": "Talvex_Battery", "keys": [{"name": "DeviceID", "value": 7}], "healthStates": [20]},)"
                      R"({"class": "CIM_Sensor", "keys": [{"name": "DeviceID", "value": "nohost"}], "healthStates": [10]},)" +
                      element("CIM_Sensor", "nullhost", "[10]", R"(, "hostName": "NULL")") + "," +
                      element("CIM_Sensor", "longhost", "[10]", R"(, "hostName": ")" + std::string(80, 'h') + "\"") + "," +
                      element("CIM_Sensor", "longns", "[10]", R"(, "namespace": "root/a-namespace-of-forty-characters-xx")") +
                      "," + element(kLongSensorClass, "longclass", "[10]") + "," + element("CIM_Sensor", "after", "[10]")));
    takeLoggedLines();
    poll();
    poll();
    const std::vector<LoggedLine> each = {
        dropped("10", "CIM_Sensor"), dropped("10", "CIM_Sensor"), dropped("10", "CIM_Sensor"), dropped("10", "CIM_Sensor"),
        dropped("10", std::string(kLongSensorClass).substr(0, 79)),
        LoggedLine{LOG_ERR, "Talvex_Battery has a non string key, this in not supported\n"},
        dropped("20", "Talvex_Battery")};
    std::vector<LoggedLine> twice = each;
    twice.insert(twice.end(), each.begin(), each.end());
    EXPECT_EQ(takeLoggedLines(), twice);
    ASSERT_TRUE(recordOf("nohost"));
    EXPECT_EQ(recordOf("nohost")->hostName, std::string("NULL"));
    for (const char *id : {"nullhost", "longhost", "longns", "longclass"}) EXPECT_FALSE(recordOf(id)) << id;
    // The dropped elements between them took event numbers.
    EXPECT_EQ(recordOf("after")->eventId, recordOf("nohost")->eventId + 4);
    EXPECT_EQ(rollup(), 20);
}

TEST_F(LatchingTest, ClassNobodyServesIsPassedOver) {
    stop();
    BrokerConfig config = linkedInConfig();
    auto &registrations = config.registrations;
    registrations.erase(std::remove_if(registrations.begin(), registrations.end(),
                                       [](const ProviderRegistration &r) { return r.className == "CIM_Sensor"; }),
                        registrations.end());
    start(std::move(config));
    serve(profileWith(element("CIM_Sensor", "unserved", "[10]") + "," + element("Talvex_DiskDrive", "served", "[20]")));
    poll();
    EXPECT_FALSE(recordOf("unserved"));
    EXPECT_TRUE(recordOf("served"));
}

TEST_F(LatchingTest, SameKeysInTwoClassesAreTwoElements) {
    serve(profileWith(element("Talvex_StorageVolume", "twin", "[10]") + "," + element("Talvex_StorageExtent", "twin", "[20]")));
    poll();
    std::vector<std::string> classes;
    for (const auto &record : recordsOf("twin")) classes.push_back(record.className);
    EXPECT_EQ(classes, (std::vector<std::string>{"Talvex_StorageVolume", "Talvex_StorageExtent"}));
}

}  // namespace
}  // namespace latchedtest

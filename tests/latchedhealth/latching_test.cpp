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

LoggedLine err(const std::string &text) { return LoggedLine{LOG_ERR, text}; }

using LatchingTest = LatchedHealthBroker;

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
    EXPECT_EQ(recordOf("up")->hostName, std::string("esx1"));
    EXPECT_EQ(recordOf("up")->nameSpace, std::string(kNs));
}

TEST_F(LatchingTest, RollupOfHealthyAndEmptyPolls) {
    serve(profileWith(element("CIM_Sensor", "ok1", "[5]") + "," + element("Talvex_Battery", "ok2", "[5]")));
    poll();
    EXPECT_EQ(rollup(), 5);
    EXPECT_FALSE(recordOf("ok1") || recordOf("ok2"));
    serve(profileWith(""));
    poll();
    EXPECT_EQ(rollup(), 0);
}

TEST_F(LatchingTest, RecoveredElementStaysLatchedWhileRollupFallsBack) {
    serve(profileWith(element("Talvex_Battery", "dimm", "[15, 5]")));
    poll();
    EXPECT_EQ(rollup(), 15);
    poll();
    EXPECT_EQ(rollup(), 5);
    EXPECT_EQ(recordOf("dimm")->healthState, 15);
}

TEST_F(LatchingTest, IgnoredValuesCountNowhere) {
    // null, missing and wrongly typed HealthState values
    serve(profileWith(element("CIM_Sensor", "null", "[null]") + "," + element("CIM_Sensor", "missing", R"(["missing"])") +
                      "," + element("CIM_Sensor", "text", R"(["25"])") + "," + element("CIM_Sensor", "wide", "[70000]") +
                      "," + element("CIM_Sensor", "flag", "[true]")));
    poll();
    EXPECT_EQ(rollup(), 0);
    for (const char *id : {"null", "missing", "text", "wide", "flag"}) EXPECT_FALSE(recordOf(id)) << id;
}

TEST_F(LatchingTest, UncopyableElementsAreDroppedEveryPollAndUseEventNumbers) {
    serve(profileWith(R"({"class": "CIM_Sensor", "keys": [], "healthStates": [10]},)"
                      R"({"class": "Talvex_Battery", "keys": [{"name": "DeviceID", "value": 7}], "healthStates": [20]},)" +
                      element("CIM_Sensor", "before", "[10]") + "," + element("CIM_Sensor", "after", "[10]")));
    takeLoggedLines();
    poll();
    poll();
    const std::vector<LoggedLine> dropped = {
        err("Failed to copy object, dropping health state 10 for CIM_Sensor\n"),
        err("Talvex_Battery has a non string key, this in not supported\n"),
        err("Failed to copy object, dropping health state 20 for Talvex_Battery\n")};
    std::vector<LoggedLine> twice = dropped;
    twice.insert(twice.end(), dropped.begin(), dropped.end());
    EXPECT_EQ(takeLoggedLines(), twice);
    // The keyless element took the number between no record and "before".
    EXPECT_EQ(recordOf("after")->eventId, recordOf("before")->eventId + 1);
}

TEST_F(LatchingTest, HostNamesAndLongTextsAsRecordedOrDropped) {
    const std::string longHost(80, 'h');
    serve(profileWith(R"({"class": "CIM_Sensor", "keys": [{"name": "DeviceID", "value": "nohost"}], "healthStates": [10]},)" +
                      element("CIM_Sensor", "nullhost", "[10]", R"(, "hostName": "NULL")") + "," +
                      element("CIM_Sensor", "longhost", "[10]", R"(, "hostName": ")" + longHost + "\"") + "," +
                      element("CIM_Sensor", "longns", "[10]", R"(, "namespace": "root/a-namespace-of-forty-characters-xx")")));
    takeLoggedLines();
    poll();
    ASSERT_TRUE(recordOf("nohost"));
    EXPECT_EQ(recordOf("nohost")->hostName, std::string("NULL"));
    // A record that would rebuild another path is dropped, not kept wrong.
    for (const char *id : {"nullhost", "longhost", "longns"}) EXPECT_FALSE(recordOf(id)) << id;
    EXPECT_THAT(takeLoggedLines(), testing::Each(err("Failed to copy object, dropping health state 10 for CIM_Sensor\n")));
}

TEST_F(LatchingTest, ClassTooLongForARecordIsDropped) {
    serve(profileWith(element(kLongSensorClass, "longclass", "[10]")));
    takeLoggedLines();
    poll();
    EXPECT_FALSE(recordOf("longclass"));
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{err(
                                     "Failed to copy object, dropping health state 10 for " +
                                     std::string(kLongSensorClass).substr(0, 79) + "\n")}));
    EXPECT_EQ(rollup(), 10);
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

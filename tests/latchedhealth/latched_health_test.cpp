// The latched-health providers over polls the tests script. Latching: each
// case scripts the watched elements' health per poll and checks the
// records, the rollup and what was logged. Then the instance provider and
// the association as a client reaches them: every row of both operation
// tables, event numbers as clients write them, and where the association
// leads (names, instances and both ends on the default host are the
// consistency suite's and the demo's). Records live for the whole process,
// so every case names its own elements.
#include <gtest/gtest.h>
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

std::string text(const CimValue *value) { return value != nullptr ? value->text : "<absent>"; }

const ObjectPath kNumericEventId{"", kNs, "Talvex_LatchedHealthState", {{"EventId", CimValue::makeUnsigned(CMPI_uint32, 1)}}};

class HealthProviderTest : public LatchedHealthBroker {
protected:
    // The number the element's record had after its first poll, which an
    // escalation at the second gave up, and the record's number now.
    std::pair<std::string, std::string> escalated(const std::string &deviceId) {
        serve(profileWith(element("Talvex_DiskDrive", deviceId, "[10, 20]")));
        poll();
        const std::string before = std::to_string(recordOf(deviceId)->eventId);
        poll();
        return {before, std::to_string(recordOf(deviceId)->eventId)};
    }
};

TEST_F(HealthProviderTest, OperationTables) {
    const auto [before, id] = escalated("table");
    const ObjectPath nullEventId{"", kNs, "Talvex_LatchedHealthState", {{"EventId", CimValue::makeNull(CMPI_string)}}};
    const struct {
        const char *what;
        Response response;
        CMPIrc rc;
        const char *message;
    } rows[] = {
        {"ein other class", broker->enumInstanceNames(classPath("Test_UnservedHealth")), CMPI_RC_ERR_FAILED, "invalid class name"},
        {"gi other class", broker->getInstance(recordPath(id, "Test_UnservedHealth"), std::nullopt), CMPI_RC_ERR_NOT_FOUND, "invalid class name"},
        {"gi without EventId", broker->getInstance(classPath("Talvex_LatchedHealthState"), std::nullopt), CMPI_RC_ERR_FAILED, "failed to get instances"},
        {"gi null EventId", broker->getInstance(nullEventId, std::nullopt), CMPI_RC_ERR_FAILED, "failed to get instances"},
        {"rin without EventId", broker->referenceNames(classPath("Talvex_LatchedHealthState"), "", ""), CMPI_RC_ERR_FAILED, "Invalid event id"},
        {"rin given-up EventId", broker->referenceNames(recordPath(before), "", ""), CMPI_RC_ERR_NOT_FOUND, "Requested event id not found"},
    };
    for (const auto &row : rows) {
        EXPECT_EQ(row.response.rc, row.rc) << row.what;
        EXPECT_EQ(row.response.message.value_or("<none>"), row.message) << row.what;
        EXPECT_TRUE(row.response.instances.empty() && row.response.paths.empty()) << row.what;
    }
    EXPECT_NE(broker->referenceNames(kNumericEventId, "", "").rc, CMPI_RC_OK);
}

// The number is read as strtol reads it, clamped to 32 bits; the number an
// escalated record gave up names nothing any more.
TEST_F(HealthProviderTest, EventIdAsClientsWriteIt) {
    const auto [before, id] = escalated("written");
    const struct {
        std::string eventId;
        bool found;
    } rows[] = {{id + "abc", true}, {"  +" + id, true}, {"-" + id, id == "0"}, {"99999999999999", false}, {before, false}};
    for (const auto &row : rows) {
        const Response got = broker->getInstance(recordPath(row.eventId), std::nullopt);
        EXPECT_EQ(got.ok(), row.found) << row.eventId;
        if (got.ok()) {
            EXPECT_EQ(text(got.instances.at(0).property("EventId")), id) << row.eventId;
        } else {
            EXPECT_EQ(got.message.value_or(""), "failed to get instances") << row.eventId;
        }
    }
    // Without digits the number is 0, whatever record that names.
    EXPECT_EQ(broker->getInstance(recordPath("abc"), std::nullopt).rc, broker->getInstance(recordPath("0"), std::nullopt).rc);
    EXPECT_NE(broker->getInstance(kNumericEventId, std::nullopt).rc, CMPI_RC_OK);
}

// The element keeps its host, and nothing leads back from it.
TEST_F(HealthProviderTest, AssociationLeadsFromRecordToElementOnly) {
    const Response refs = broker->references(recordPath(escalated("followed").second), "", "", {});
    ASSERT_EQ(refs.instances.size(), 1u) << refs.message.value_or("");
    const CimValue *dependent = refs.instances[0].property("Dependent");
    ASSERT_TRUE(dependent && dependent->reference);
    EXPECT_EQ(dependent->reference->host, "esx1");
    const Response element = broker->associatorNames(*dependent->reference, "", "", "", "");
    EXPECT_TRUE(element.ok() && element.paths.empty());
}

}  // namespace
}  // namespace latchedtest

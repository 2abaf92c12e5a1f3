// The latched-health instance provider and the association through the
// broker, as a client reaches them: every row of both operation tables,
// event numbers as clients write them, and the paths answered.
#include <gmock/gmock.h>

#include "LatchedHealthBroker.h"

namespace latchedtest {
namespace {

std::string text(const CimValue *value) { return value != nullptr ? value->text : "<absent>"; }

const ObjectPath kNumericEventId{"", kNs, "Talvex_LatchedHealthState", {{"EventId", CimValue::makeUnsigned(CMPI_uint32, 1)}}};

class HealthProviderTest : public LatchedHealthBroker {
protected:
    // The event number of a fresh profile's only element, after one poll.
    std::string latched(const std::string &deviceId, const std::string &states = "[20]") {
        serve(profileWith(element("Talvex_DiskDrive", deviceId, states)));
        poll();
        return std::to_string(recordOf(deviceId)->eventId);
    }
};

TEST_F(HealthProviderTest, OperationTable) {
    const std::string id = latched("table");
    struct Row {
        const char *what;
        Response response;
        CMPIrc rc;
        const char *message;
    };
    const Row rows[] = {
        {"ein other class", broker->enumInstanceNames(classPath("Test_UnservedHealth")), CMPI_RC_ERR_FAILED, "invalid class name"},
        {"ei other class", broker->enumInstances(classPath("Test_UnservedHealth"), std::nullopt), CMPI_RC_ERR_FAILED, "invalid class name"},
        {"gi other class", broker->getInstance(recordPath(id, "Test_UnservedHealth"), std::nullopt), CMPI_RC_ERR_NOT_FOUND, "invalid class name"},
        {"gi without EventId", broker->getInstance(classPath("Talvex_LatchedHealthState"), std::nullopt), CMPI_RC_ERR_FAILED, "failed to get instances"},
        {"gi null EventId", broker->getInstance(ObjectPath{"", kNs, "Talvex_LatchedHealthState", {{"EventId", CimValue::makeNull(CMPI_string)}}}, std::nullopt), CMPI_RC_ERR_FAILED, "failed to get instances"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(row.response.rc, row.rc) << row.what;
        EXPECT_EQ(row.response.message.value_or("<none>"), row.message) << row.what;
        EXPECT_TRUE(row.response.instances.empty() && row.response.paths.empty()) << row.what;
    }
}

TEST_F(HealthProviderTest, RecordsAndRollupAsInstancesAndNames) {
    const std::string id = latched("shown");
    const Response names = broker->enumInstanceNames(classPath("talvex_latchedhealthstate"));
    std::vector<std::string> texts;
    for (const ObjectPath &path : names.paths) texts.push_back(formatPath(path));
    EXPECT_THAT(texts, testing::Contains(R"(root/cimv2:talvex_latchedhealthstate.EventId=")" + id + "\""));
    const Response got = broker->getInstance(recordPath(id), std::nullopt);
    ASSERT_EQ(got.instances.size(), 1u) << got.message.value_or("");
    const Instance &record = got.instances.front();
    EXPECT_EQ(text(record.property("EventId")), id);
    EXPECT_EQ(text(record.property("LatchedClassName")), "Talvex_DiskDrive");
    EXPECT_EQ(text(record.property("LatchedNamespace")), kNs);
    ASSERT_TRUE(record.property("HealthState") && record.property("Timestamp"));
    EXPECT_EQ(record.property("HealthState")->unsignedValue, 20u);
    EXPECT_FALSE(record.property("Timestamp")->dateTime.interval);

    // One rollup, named by any path a client gives.
    const Response rollupNames = broker->enumInstanceNames(classPath("Talvex_RollupHealthState"));
    ASSERT_EQ(rollupNames.paths.size(), 1u);
    EXPECT_EQ(formatPath(rollupNames.paths[0]), R"(root/cimv2:Talvex_RollupHealthState.Name="Talvex Rollup Health State")");
    const ObjectPath anyName{"", kNs, "talvex_rolluphealthstate", {{"Name", CimValue::makeString("whatever")}}};
    const Response rolled = broker->getInstance(anyName, std::nullopt);
    ASSERT_EQ(rolled.instances.size(), 1u);
    EXPECT_EQ(rolled.instances[0].property("HealthState")->unsignedValue, 20u);
    EXPECT_EQ(text(rolled.instances[0].property("Name")), "Talvex Rollup Health State");
}

// The number is read as strtol reads it, clamped to 32 bits; the number an
// escalated record gave up names nothing any more.
TEST_F(HealthProviderTest, EventIdAsClientsWriteIt) {
    const std::string before = latched("written", "[10, 20]");
    poll();
    const std::string id = std::to_string(recordOf("written")->eventId);
    const struct {
        std::string eventId;
        bool found;
    } rows[] = {{id + "abc", true}, {"  +" + id, true}, {"-" + id, id == "0"}, {"99999999999999", false},
                {id + ".0", true},  {before, false}};
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

TEST_F(HealthProviderTest, AssociationLeadsFromRecordToElementOnly) {
    const std::string before = latched("followed", "[10, 20]");
    poll();
    const ObjectPath record = recordPath(std::to_string(recordOf("followed")->eventId), "TALVEX_LatchedHealthState");
    const Response refs = broker->references(record, "", "", std::nullopt);
    ASSERT_EQ(refs.instances.size(), 1u) << refs.message.value_or("");
    const CimValue *antecedent = refs.instances[0].property("Antecedent");
    const CimValue *dependent = refs.instances[0].property("Dependent");
    ASSERT_TRUE(antecedent && dependent);
    EXPECT_EQ(formatPath(*antecedent->reference), formatPath(record));
    EXPECT_EQ(formatPath(*dependent->reference),
              R"(root/cimv2:Talvex_DiskDrive.CreationClassName="Talvex_DiskDrive",DeviceID="followed")");
    EXPECT_EQ(dependent->reference->host, "esx1");
    const Response element = broker->associatorNames(*dependent->reference, "", "", "", "");
    EXPECT_TRUE(element.ok() && element.paths.empty());
    const struct {
        ObjectPath from;
        CMPIrc rc;
        const char *message;
    } rows[] = {
        {classPath("Talvex_LatchedHealthState"), CMPI_RC_ERR_FAILED, "Invalid event id"},
        {recordPath(before), CMPI_RC_ERR_NOT_FOUND, "Requested event id not found"},
    };
    for (const auto &row : rows) {
        const Response answer = broker->referenceNames(row.from, "", "");
        EXPECT_EQ(answer.rc, row.rc) << formatPath(row.from);
        EXPECT_EQ(answer.message.value_or(""), row.message);
    }
    EXPECT_NE(broker->referenceNames(kNumericEventId, "", "").rc, CMPI_RC_OK);
}

}  // namespace
}  // namespace latchedtest

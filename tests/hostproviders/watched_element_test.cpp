// The watched hardware classes through the embedded broker, as the health
// monitor reads them: each enumeration of a class is its next poll, every
// HealthState arrives with the type the profile wrote it in (or not at all),
// paths carry the scripted host, keys and key types, and getInstance finds
// exactly the scripted paths.
#include "UpCall.h"
#include "model/CimTypes.h"
#include "model/ValueText.h"

namespace {

using namespace producttest;

constexpr const char *kLongSensor = "Test_SensorOfAVendorWhoseClassNamesRunPastEightyCharactersAsSomeRealHostSchemasDo";

std::string watchedHost() {
    return std::string(R"({"hostType": "Corlai", "watchedElements": [
        {"class": "cim_SENSOR", "hostName": "esx1",
         "keys": [{"name": "CreationClassName", "value": "CIM_Sensor"}, {"name": "DeviceID", "value": "fan1"}],
         "healthStates": [10, null, "missing", "OK", -1, 70000, 18446744073709551615, true, 65535]},
        {"class": ")") + kLongSensor + R"(", "keys": [{"name": "DeviceID", "value": "long1"}], "healthStates": [5]},
        {"class": "CIM_PowerSupply", "keys": [{"name": "DeviceID", "value": "psu1"}], "healthStates": [0, 5]},
        {"class": "Talvex_Battery", "keys": []},
        {"class": "Talvex_StoragePool", "keys": [{"name": "InstanceID", "value": 7}], "healthStates": [5]},
        {"class": "Talvex_StorageExtent", "keys": [{"name": "DeviceID", "value": -2}], "healthStates": [5]},
        {"class": "Talvex_Controller", "keys": [{"name": "DeviceID", "value": true}], "healthStates": [5]}]})";
}

// "uint16 10", "null uint16", "absent": the type is what a wrong provider
// gets wrong.
std::string healthState(const Instance &instance) {
    const CimValue *value = instance.property("HealthState");
    if (value == nullptr) return "absent";
    if (value->null) return "null " + cimTypeName(value->type);
    std::string literal;
    bool quoted = false;
    scalarText(*value, literal, quoted);
    return cimTypeName(value->type) + " " + literal;
}

const Instance *withDeviceId(const Response &response, const std::string &deviceId) {
    for (const Instance &instance : response.instances) {
        const CimValue *key = instance.path.key("DeviceID");
        if (key != nullptr && key->text == deviceId) return &instance;
    }
    return nullptr;
}

class WatchedElementProvider : public ProductBroker {
protected:
    WatchedElementProvider() : ProductBroker("CIM_Sensor", kLongSensor) {}
    void SetUp() override {
        ProductBroker::SetUp();
        serve(watchedHost());
    }
};

// Per class, from when the profile was loaded.
TEST_F(WatchedElementProvider, EachEnumerationIsTheNextPollAndNothingElseCounts) {
    const char *const polls[] = {"uint16 10",    "null uint16",  "absent",
                                 "string OK",    "sint64 -1",    "sint64 70000",
                                 "uint64 18446744073709551615",  "boolean TRUE",
                                 "uint16 65535", "uint16 65535"};
    for (const char *poll : polls) {
        const Response sensors = broker->enumInstances(classPath("CIM_Sensor"), {});
        ASSERT_TRUE(sensors.ok()) << sensors.rc;
        EXPECT_EQ(sensors.instances.size(), 2u) << "the fan and the subclass's sensor, not the power supply";
        const Instance *fan = withDeviceId(sensors, "fan1");
        ASSERT_NE(fan, nullptr);
        EXPECT_EQ(healthState(*fan), poll);
        EXPECT_EQ(broker->enumInstanceNames(classPath("CIM_Sensor")).paths.size(), 2u) << "names are no poll";
        const Response got = broker->getInstance(fan->path, {});
        ASSERT_TRUE(got.ok()) << got.rc;
        ASSERT_EQ(got.instances.size(), 1u);
        EXPECT_EQ(healthState(got.instances[0]), poll) << "the poll last enumerated";
    }
    const Response supplies = broker->enumInstances(classPath("CIM_PowerSupply"), {});
    ASSERT_EQ(supplies.instances.size(), 1u);
    EXPECT_EQ(healthState(supplies.instances[0]), "uint16 0") << "another class's first poll";
    serve(watchedHost());
    const Response again = broker->enumInstances(classPath("CIM_Sensor"), {});
    ASSERT_NE(withDeviceId(again, "fan1"), nullptr);
    EXPECT_EQ(healthState(*withDeviceId(again, "fan1")), "uint16 10") << "a loaded profile starts again";
}

// The class as the profile spells it, the host, and keys of every scripted
// type, none for a keyless element, to a client's names and its gets alike.
TEST_F(WatchedElementProvider, PathsAreTheScriptedOnesAndEachNamesItsElement) {
    const struct {
        const char *className;
        const char *keyName;  // null: a keyless path
        CimValue key;
        const char *healthState;
    } cases[] = {
        {"Talvex_Battery", nullptr, {}, "absent"},
        {"Talvex_StoragePool", "InstanceID", CimValue::makeUnsigned(CMPI_uint64, 7), "uint16 5"},
        {"Talvex_StorageExtent", "DeviceID", CimValue::makeSigned(CMPI_sint64, -2), "uint16 5"},
        {"Talvex_Controller", "DeviceID", CimValue::makeBoolean(true), "uint16 5"},
    };
    for (const auto &c : cases) {
        const Response names = broker->enumInstanceNames(classPath(c.className));
        ASSERT_TRUE(names.ok()) << c.className << ": " << names.rc;
        ASSERT_EQ(names.paths.size(), 1u) << c.className;
        const ObjectPath &name = names.paths[0];
        EXPECT_EQ(name.host, "") << c.className;
        if (c.keyName == nullptr) {
            EXPECT_TRUE(name.keys.empty()) << c.className;
        } else {
            ASSERT_NE(name.key(c.keyName), nullptr) << c.className;
            EXPECT_EQ(*name.key(c.keyName), c.key) << c.className;
        }
        const Response got = broker->getInstance(name, {});
        ASSERT_TRUE(got.ok()) << c.className << ": " << got.rc;
        EXPECT_EQ(pathTexts(got), pathTexts(names)) << c.className;
        EXPECT_EQ(healthState(got.instances.at(0)), c.healthState) << c.className;
        EXPECT_EQ(upCallStatus(*broker, name), CMPI_RC_OK) << c.className;
    }
    const Response sensors = broker->enumInstances(classPath("CIM_Sensor"), {});
    ASSERT_NE(withDeviceId(sensors, "fan1"), nullptr);
    const ObjectPath &fan = withDeviceId(sensors, "fan1")->path;
    EXPECT_EQ(fan.className, "cim_SENSOR");
    EXPECT_EQ(fan.host, "esx1");
    EXPECT_EQ(fan.nameSpace, kNs);
    ASSERT_NE(withDeviceId(sensors, "long1"), nullptr);
    EXPECT_EQ(withDeviceId(sensors, "long1")->path.className, kLongSensor) << "a subclass keeps its own class";
    ObjectPath pool{"", kNs, "Talvex_StoragePool", {{"InstanceID", CimValue::makeUnsigned(CMPI_uint32, 7)}}};
    EXPECT_TRUE(broker->getInstance(pool, {}).ok()) << "an integer key of another width";
}

TEST_F(WatchedElementProvider, EveryOtherPathIsNotFoundToClientsAndUpCalls) {
    const CimValue fanClass = CimValue::makeString("CIM_Sensor");
    const auto sensor = [](const char *className, std::vector<NamedValue> keys) {
        return ObjectPath{"", kNs, className, std::move(keys)};
    };
    const struct {
        const char *what;
        ObjectPath path;
    } cases[] = {
        {"another device", sensor("CIM_Sensor", {{"CreationClassName", fanClass},
                                                 {"DeviceID", CimValue::makeString("fan2")}})},
        {"a key short", sensor("CIM_Sensor", {{"DeviceID", CimValue::makeString("fan1")}})},
        {"another class", sensor("CIM_PowerSupply", {{"CreationClassName", fanClass},
                                                     {"DeviceID", CimValue::makeString("fan1")}})},
        {"a number of another sign",
         sensor("Talvex_StorageExtent", {{"DeviceID", CimValue::makeUnsigned(CMPI_uint64, 2)}})},
        {"a boolean as text", sensor("Talvex_Controller", {{"DeviceID", CimValue::makeString("true")}})},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, {});
        EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_FOUND) << c.what;
        EXPECT_TRUE(response.instances.empty()) << c.what;
        EXPECT_EQ(upCallStatus(*broker, c.path), CMPI_RC_ERR_NOT_FOUND) << c.what;
    }
}

}  // namespace

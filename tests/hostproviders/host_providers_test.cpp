// The stand-in host providers through the embedded broker, loaded beside
// the product: the scripted paths, with keys of every scripted type, are
// found by a client and by a provider's up-call, and every other path is
// NOT_FOUND to both (an up-call answered OK without an instance kills sfcb's
// provider process). Polls through the stand-in are the latched-health
// tests'.
#include "CmpiBroker.h"
#include "CmpiObjectPath.h"
#include "CmpiStatus.h"
#include "ProductBroker.h"
#include "core/ObjectPool.h"

namespace {

using namespace producttest;

// Served by the watched-element provider in this test only.
constexpr const char *kLongSensor = "Test_SensorOfAVendorWhoseClassNamesRunPastEightyCharactersAsSomeRealHostSchemasDo";
constexpr const char *kSystem = "OMC_UnitaryComputerSystem";

// The status a provider's getInstance up-call for `path` ends in.
CMPIrc upCallStatus(Broker &broker, const ObjectPath &path) {
    const RequestScope request;
    const CmpiBroker up(broker.cmpiBroker());  // remembered as the maker of the binding's objects
    CmpiObjectPath cop(path.nameSpace.c_str(), path.className.c_str());
    for (const NamedValue &key : path.keys) {
        const CimValue &value = key.value;
        switch (value.type) {
        case CMPI_string: cop.setKey(key.name.c_str(), CmpiData(value.text)); break;
        case CMPI_boolean: cop.setKey(key.name.c_str(), CmpiData(value.boolean)); break;
        case CMPI_uint32: cop.setKey(key.name.c_str(), CmpiData(CMPIUint32(value.unsignedValue))); break;
        case CMPI_uint64: cop.setKey(key.name.c_str(), CmpiData(CMPIUint64(value.unsignedValue))); break;
        case CMPI_sint64: cop.setKey(key.name.c_str(), CmpiData(CMPISint64(value.signedValue))); break;
        default: ADD_FAILURE() << "no up-call key of CMPI type " << value.type;
        }
    }
    try {
        up.getInstance(CmpiContext(broker.newContext(path.nameSpace)), cop, nullptr);
    } catch (const CmpiStatus &status) {
        return status.rc();
    }
    return CMPI_RC_OK;
}

class HostProviders : public ProductBroker {
protected:
    HostProviders() : ProductBroker("CIM_Sensor", kLongSensor) {}
};

TEST_F(HostProviders, ScriptedPathsAreFoundAndEveryOtherIsNotFoundToClientsAndUpCalls) {
    serve(std::string(R"({"hostType": "Corlai", "watchedElements": [
        {"class": "CIM_Sensor", "keys": [{"name": "CreationClassName", "value": "CIM_Sensor"},
                                         {"name": "DeviceID", "value": "fan1"}], "healthStates": [10]},
        {"class": ")") + kLongSensor + R"(", "keys": [{"name": "DeviceID", "value": "long1"}]},
        {"class": "Talvex_Battery", "keys": []},
        {"class": "Talvex_StoragePool", "keys": [{"name": "InstanceID", "value": 7}], "healthStates": [5]},
        {"class": "Talvex_StorageExtent", "keys": [{"name": "DeviceID", "value": -2}], "healthStates": [5]},
        {"class": "Talvex_Controller", "keys": [{"name": "DeviceID", "value": true}], "healthStates": [5]}]})");
    const CimValue sensorClass = CimValue::makeString("CIM_Sensor"), fan1 = CimValue::makeString("fan1");
    const CimValue systemClass = CimValue::makeString(kSystem), host = CimValue::makeString(hostName);
    const auto path = [](const char *className, std::vector<NamedValue> keys) {
        return ObjectPath{"", kNs, className, std::move(keys)};
    };
    const struct {
        const char *what;
        ObjectPath path;
        bool found;
    } cases[] = {
        {"the system the product's paths name", path(kSystem, {{"CreationClassName", systemClass}, {"Name", host}}),
         true},
        {"a sensor", path("CIM_Sensor", {{"CreationClassName", sensorClass}, {"DeviceID", fan1}}), true},
        {"a class of a name past 80 characters", path(kLongSensor, {{"DeviceID", CimValue::makeString("long1")}}), true},
        {"no keys", path("Talvex_Battery", {}), true},
        {"an integer key of another width",
         path("Talvex_StoragePool", {{"InstanceID", CimValue::makeUnsigned(CMPI_uint32, 7)}}), true},
        {"a signed key", path("Talvex_StorageExtent", {{"DeviceID", CimValue::makeSigned(CMPI_sint64, -2)}}), true},
        {"a boolean key", path("Talvex_Controller", {{"DeviceID", CimValue::makeBoolean(true)}}), true},
        {"another device", path("CIM_Sensor", {{"CreationClassName", sensorClass},
                                               {"DeviceID", CimValue::makeString("fan2")}}), false},
        {"a key short", path("CIM_Sensor", {{"DeviceID", fan1}}), false},
        {"another class", path("CIM_PowerSupply", {{"CreationClassName", sensorClass}, {"DeviceID", fan1}}), false},
        {"a number of another sign",
         path("Talvex_StorageExtent", {{"DeviceID", CimValue::makeUnsigned(CMPI_uint64, 2)}}), false},
        {"another host name",
         path(kSystem, {{"CreationClassName", systemClass}, {"Name", CimValue::makeString(hostName + "x")}}), false},
        {"a system without its name", path(kSystem, {{"CreationClassName", systemClass}}), false},
    };
    for (const auto &c : cases) {
        const Response response = broker->getInstance(c.path, {});
        EXPECT_EQ(response.rc, c.found ? CMPI_RC_OK : CMPI_RC_ERR_NOT_FOUND) << c.what;
        EXPECT_EQ(response.instances.size(), c.found ? 1u : 0u) << c.what;
        EXPECT_EQ(upCallStatus(*broker, c.path), c.found ? CMPI_RC_OK : CMPI_RC_ERR_NOT_FOUND) << c.what;
    }
}

}  // namespace

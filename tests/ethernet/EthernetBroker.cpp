#include "EthernetBroker.h"

#include <unistd.h>

#include <algorithm>
#include <sstream>

#include "hostsim/HostSimControl.h"
#include "model/MofInstanceText.h"
#include "model/PathText.h"

namespace ethernettest {

void EthernetBroker::SetUp() {
    std::vector<std::string> mofs = {TVX_PRODUCT_MOFS};
    mofs.push_back(TVX_TEST_MOF);
    BrokerConfig config = loadBrokerConfig({TVX_PROVIDER_DIR}, TVX_PROVIDER_REG, mofs);
    for (const ProviderRegistration &registration : std::vector<ProviderRegistration>(config.registrations)) {
        if (registration.className != "Talvex_EthernetPort") continue;
        ProviderRegistration unserved = registration;
        unserved.className = kUnservedClass;
        config.registrations.push_back(unserved);
    }
    broker = std::make_unique<Broker>(std::move(config));
    char name[256] = {};
    ::gethostname(name, sizeof name - 1);
    hostName = name;
}

void EthernetBroker::TearDown() {
    EXPECT_EQ(broker->liveObjectCount(), 0u);
    broker->shutdown();
    EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a system-information list was not freed";
    HostSim_ResetProfile();
}

void EthernetBroker::serve(const std::string &profileJson) {
    char error[256];
    ASSERT_EQ(HostSim_LoadProfileText(profileJson.c_str(), error, sizeof error), 0) << error;
}

ObjectPath EthernetBroker::classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }

ObjectPath EthernetBroker::portPath(const std::string &deviceId) const {
    return ObjectPath{"", kNs, "Talvex_EthernetPort",
                      {{"DeviceID", CimValue::makeString(deviceId)},
                       {"SystemCreationClassName", CimValue::makeString("OMC_UnitaryComputerSystem")},
                       {"SystemName", CimValue::makeString(hostName)},
                       {"CreationClassName", CimValue::makeString("Talvex_EthernetPort")}}};
}

ObjectPath EthernetBroker::identityPath(const std::string &cls, const std::string &instanceId) {
    return ObjectPath{"", kNs, cls, {{"InstanceID", CimValue::makeString(instanceId)}}};
}

std::map<std::string, std::string> literals(const Instance &instance) {
    std::map<std::string, std::string> result;
    std::istringstream mof(formatInstanceMof(instance));
    std::string line;
    while (std::getline(mof, line)) {
        const std::size_t equals = line.find(" = ");
        if (line.rfind("    ", 0) != 0 || equals == std::string::npos) continue;
        result[line.substr(4, equals - 4)] = line.substr(equals + 3, line.size() - equals - 4);
    }
    return result;
}

std::map<std::string, CMPIType> types(const Instance &instance) {
    std::map<std::string, CMPIType> result;
    for (const NamedValue &property : instance.properties) result[property.name] = property.value.type;
    return result;
}

std::string twoAdapterProfile(const std::string &faults) {
    return R"({"hostType": "Corlai", "adapters": [
        {"name": "nic0", "driverName": "netdrv", "driverVersion": "1.2.3",
         "firmwareVersion": "fw-9", "interfaceName": "vmk-nic0", "capabilities": "0x800",
         "enabledCapabilities": "0x0", "pciBus": 16, "pciSlot": 2, "pciFunction": 1,
         "pciVendorId": "0x15", "pciDeviceId": "0x10fb", "linkUp": true, "speedMbps": 1000,
         "fullDuplex": true, "mac": "02:1b:21:0a:0b:0c", "mtu": 9000},
        {"name": "nic1", "driverName": "tg3", "driverVersion": "3.1", "firmwareVersion": "bc 5",
         "linkUp": false, "mac": "d0:94:66:1a:2b:3d", "mtu": 1500}
    ], "faults": [)" + faults + "]}";
}

std::string referenceText(const Instance &instance, const char *property) {
    const CimValue *value = instance.property(property);
    return value != nullptr && value->reference ? formatPath(*value->reference) : std::string();
}

std::vector<std::string> pathTexts(const std::vector<ObjectPath> &paths) {
    std::vector<std::string> result;
    for (const ObjectPath &path : paths) result.push_back(formatPath(path));
    return result;
}

std::vector<std::string> pathTexts(const std::vector<Instance> &instances) {
    std::vector<ObjectPath> paths;
    for (const Instance &instance : instances) paths.push_back(instance.path);
    return pathTexts(paths);
}

}  // namespace ethernettest

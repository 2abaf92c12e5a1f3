// The product library in the embedded broker beside the stand-in host
// providers, serving a host profile given as text, with the answers reduced to what a client compares. One provider
// is also registered for a class of the test's own MOF that it does not
// serve, so that its answer to an unknown class can be seen.
#pragma once

#include <gtest/gtest.h>
#include <unistd.h>

#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "core/Broker.h"
#include "hostsim/HostSimControl.h"
#include "model/MofInstanceText.h"
#include "model/PathText.h"

namespace producttest {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";

class ProductBroker : public testing::Test {
protected:
    ProductBroker(const char *served, const char *unserved) : servedClass(served), unservedClass(unserved) {}

    void SetUp() override {
        BrokerConfig config = loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR},
                                               {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                               {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF, TVX_TEST_MOF});
        for (ProviderRegistration registration : std::vector<ProviderRegistration>(config.registrations)) {
            if (registration.className != servedClass) continue;
            registration.className = unservedClass;
            config.registrations.push_back(registration);
        }
        broker = std::make_unique<Broker>(std::move(config));
        char name[256] = {};
        ::gethostname(name, sizeof name - 1);
        hostName = name;
    }

    void TearDown() override {
        EXPECT_EQ(broker->liveObjectCount(), 0u);
        broker->shutdown();
        EXPECT_EQ(HostSim_LiveListCount(), 0u) << "a system-information list was not freed";
        HostSim_ResetProfile();
    }

    static void serve(const std::string &profileJson) {
        char error[256];
        ASSERT_EQ(HostSim_LoadProfileText(profileJson.c_str(), error, sizeof error), 0) << error;
    }

    static ObjectPath classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }

    const char *const servedClass;
    const char *const unservedClass;
    std::unique_ptr<Broker> broker;
    std::string hostName;
};

// "Name" -> the MOF literal of each property.
inline std::map<std::string, std::string> literals(const Instance &instance) {
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

// The paths a response returned and the own paths of its instances, as text.
inline std::vector<std::string> pathTexts(const Response &response) {
    std::vector<std::string> texts;
    for (const ObjectPath &path : response.paths) texts.push_back(formatPath(path));
    for (const Instance &instance : response.instances) texts.push_back(formatPath(instance.path));
    return texts;
}

}  // namespace producttest

// The product library in the embedded broker, serving a host profile given
// as text, with the answers reduced to what a client compares.
#pragma once

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "core/Broker.h"

namespace ethernettest {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";
// Served by the Ethernet port provider in these tests only, so that a class
// the provider does not know reaches it.
inline constexpr const char *kUnservedClass = "Test_UnservedPort";

class EthernetBroker : public testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    void serve(const std::string &profileJson);

    static ObjectPath classPath(const std::string &cls);
    ObjectPath portPath(const std::string &deviceId) const;
    static ObjectPath identityPath(const std::string &cls, const std::string &instanceId);

    std::unique_ptr<Broker> broker;
    std::string hostName;
};

// "Name" -> the MOF literal of each property, and the CMPI type of each.
std::map<std::string, std::string> literals(const Instance &instance);
std::map<std::string, CMPIType> types(const Instance &instance);

// Two adapters: nic0 (link up, 1000 Mb/s, MAC 02:1b:21:0a:0b:0c, driver
// netdrv 1.2.3) and nic1 (link down).
std::string twoAdapterProfile(const std::string &faults = "");

// The path a reference property holds, as text; empty when it holds none.
std::string referenceText(const Instance &instance, const char *property);

std::vector<std::string> pathTexts(const std::vector<ObjectPath> &paths);
std::vector<std::string> pathTexts(const std::vector<Instance> &instances);

}  // namespace ethernettest

// A broker loaded with the test providers, and the helpers that keep the
// tests about behaviour: building paths and comparing answers as a client
// would.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "EventSink.h"
#include "core/Broker.h"
#include "model/PathText.h"

namespace brokertest {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";

inline ObjectPath classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }

inline ObjectPath widget(const std::string &name, const std::string &cls = "Test_Widget") {
    return ObjectPath{"", kNs, cls, {{"Name", CimValue::makeString(name)}}};
}

inline ObjectPath gadget(const std::string &widgetName) {
    return ObjectPath{"", kNs, "Test_Gadget", {{"Id", CimValue::makeString("gadget-" + widgetName)}}};
}

inline ObjectPath link(const ObjectPath &owner, const ObjectPath &part) {
    return ObjectPath{"", kNs, "Test_WidgetGadget",
                      {{"Owner", CimValue::makeReference(owner)}, {"Part", CimValue::makeReference(part)}}};
}

// Paths as text, sorted: what a client compares, whatever order answers come in.
inline std::vector<std::string> texts(const std::vector<ObjectPath> &paths) {
    std::vector<std::string> result;
    for (const ObjectPath &path : paths) result.push_back(formatPath(path));
    std::sort(result.begin(), result.end());
    return result;
}

inline std::vector<std::string> texts(const std::vector<Instance> &instances) {
    std::vector<ObjectPath> paths;
    for (const Instance &inst : instances) paths.push_back(inst.path);
    return texts(paths);
}

inline std::uint64_t unsignedOf(const Instance &inst, const char *property) {
    const CimValue *value = inst.property(property);
    EXPECT_NE(value, nullptr) << property;
    return value == nullptr ? 0 : value->unsignedValue;
}

class BrokerTest : public testing::Test {
protected:
    static BrokerConfig testConfig() {
        return loadBrokerConfig({TVX_TESTPROVIDER_DIR}, {TVX_TESTPROVIDER_REG}, {TVX_TESTPROVIDER_MOF});
    }

    EventSink sink;  // declared first: it must outlive every delivery the broker makes
    Broker broker{testConfig()};
};

}  // namespace brokertest

// A broker loaded with the test providers, and the helpers that keep the
// tests about behaviour.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <string>

#include "EventSink.h"
#include "core/Broker.h"

namespace brokertest {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";

inline ObjectPath classPath(const std::string &cls) { return ObjectPath{"", kNs, cls, {}}; }

inline ObjectPath widget(const std::string &name) {
    return ObjectPath{"", kNs, "Test_Widget", {{"Name", CimValue::makeString(name)}}};
}

inline ObjectPath gadget(const std::string &widgetName) {
    return ObjectPath{"", kNs, "Test_Gadget", {{"Id", CimValue::makeString("gadget-" + widgetName)}}};
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

// A broker loaded with the plain-C conformance provider and its twin on the
// binding, and the objects both must hand over, as the broker keeps them.
// The expectations are built from conformance_samples.h alone, never from
// what a provider did.
#pragma once

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

#include "conformance_samples.h"
#include "core/Broker.h"

namespace tvxbroker {
// Failures show type, state and the exact bytes of a value.
void PrintTo(const CimValue &value, std::ostream *os);
}  // namespace tvxbroker

namespace conformance {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";

// The classes one provider serves.
struct Served {
    const char *sample;
    const char *peer;
};
inline constexpr Served kCProvider{"Conf_CSample", "Conf_CPeer"};
inline constexpr Served kTwin{"Conf_BindingSample", "Conf_BindingPeer"};

std::vector<Instance> expectedSamples(const std::string &cls);
Instance expectedPeer(const Served &provider);

// Key by key and property by property, each failure naming what differs and
// showing both values; the order of keys, properties and list items does
// not matter, as in CIM. Paths are held against the paths of `expected`.
void expectSameInstances(std::vector<Instance> actual, std::vector<Instance> expected);
void expectSamePaths(const std::vector<ObjectPath> &actual, std::vector<Instance> expected);

class ConformanceTest : public testing::Test {
protected:
    std::vector<Instance> enumerate(const std::string &cls);
    std::vector<ObjectPath> enumerateNames(const std::string &cls);

    Broker broker{loadBrokerConfig({TVX_CPROVIDER_DIR, TVX_TESTPROVIDER_DIR}, TVX_CONFORMANCE_REG,
                                   {TVX_CONFORMANCE_MOF})};
};

}  // namespace conformance

// A broker loaded with the plain-C conformance provider, the objects it must
// hand over as built from conformance_samples.h alone (never from what a
// provider did), and a text of objects that shows every difference a client
// could tell.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "conformance_samples.h"
#include "core/Broker.h"

namespace conformance {

using namespace tvxbroker;

inline constexpr const char *kNs = "root/cimv2";
inline constexpr const char *kSampleClass = "Conf_CSample";
inline constexpr const char *kPeerClass = "Conf_CPeer";

// Both samples, then the peer.
std::vector<Instance> expectedObjects();

// Keys and properties one per line, sorted by name, each value with its CMPI
// type code and exact bytes: equal texts are objects a client cannot tell
// apart (the order of keys and properties and the case of names do not count).
std::string describe(const ObjectPath &path, const std::string &indent = "");
std::string describe(const Instance &instance, const std::string &indent = "");

// Several objects, in no particular order.
template <class Object>
std::string describe(const std::vector<Object> &objects) {
    std::vector<std::string> texts;
    for (const Object &object : objects) texts.push_back(describe(object));
    std::sort(texts.begin(), texts.end());
    std::string text;
    for (const std::string &one : texts) text += one + "\n\n";
    return text;
}

class ConformanceTest : public testing::Test {
protected:
    Broker broker{loadBrokerConfig({TVX_CPROVIDER_DIR}, {TVX_CONFORMANCE_REG}, {TVX_CONFORMANCE_MOF})};
};

}  // namespace conformance

// The embedded broker against a provider written in plain C, as C providers
// for sfcb are: it must read exactly what the provider set, every value with
// its type, text as CMPI_string whichever way it was passed, and hand keys
// back to the provider in the form a C provider reads them.
#include <string>
#include <vector>

#include "ConformanceFixture.h"

namespace conformance {
namespace {

TEST_F(ConformanceTest, BrokerReadsEveryValueAsTheCProviderSetIt) {
    expectSameInstances(enumerate(kCProvider.sample), expectedSamples(kCProvider.sample));
    expectSameInstances(enumerate(kCProvider.peer), {expectedPeer(kCProvider)});
}

TEST_F(ConformanceTest, BrokerReadsTheCProviderNamesWithTheirKeyTypes) {
    std::vector<ObjectPath> expected;
    for (const conf_sample &sample : conf_samples) expected.push_back(samplePath(kCProvider.sample, sample));
    expectSamePaths(enumerateNames(kCProvider.sample), expected);
    expectSamePaths(enumerateNames(kCProvider.peer), {expectedPeer(kCProvider).path});
}

ObjectPath withKey(ObjectPath path, const std::string &key, const CimValue &value) {
    for (NamedValue &named : path.keys) {
        if (named.name == key) named.value = value;
    }
    return path;
}

// Both providers find each object by all of its keys as the broker passes
// them, and answer NOT_FOUND, never OK with nothing, for a path naming none.
TEST_F(ConformanceTest, GetInstanceFindsObjectsByAllTheirKeys) {
    for (const Served &provider : {kCProvider, kTwin}) {
        SCOPED_TRACE(provider.sample);
        const Instance peer = expectedPeer(provider);
        std::vector<Instance> found;
        for (const conf_sample &sample : conf_samples) {
            Response response = broker.getInstance(samplePath(provider.sample, sample), std::nullopt);
            EXPECT_TRUE(response.ok()) << response.message.value_or("");
            found.insert(found.end(), response.instances.begin(), response.instances.end());
        }
        expectSameInstances(found, expectedSamples(provider.sample));
        const Response peerResponse = broker.getInstance(peer.path, std::nullopt);
        EXPECT_TRUE(peerResponse.ok()) << peerResponse.message.value_or("");
        expectSameInstances(peerResponse.instances, {peer});

        const ObjectPath first = samplePath(provider.sample, conf_samples[0]);
        std::string label = conf_samples[0].label;
        ++label.back();
        const struct {
            const char *what;
            ObjectPath path;
        } misses[] = {
            {"unknown name", withKey(first, "Name", CimValue::makeString("sample-3"))},
            {"label differing in its last byte", withKey(first, "Label", CimValue::makeString(label))},
            {"slot of the other sample", withKey(first, "Slot", CimValue::makeUnsigned(CMPI_uint16, conf_samples[1].slot))},
            {"references swapped", withKey(withKey(peer.path, "Antecedent", *peer.path.key("Dependent")), "Dependent",
                                           *peer.path.key("Antecedent"))},
        };
        for (const auto &miss : misses) {
            SCOPED_TRACE(miss.what);
            const Response response = broker.getInstance(miss.path, std::nullopt);
            EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_FOUND);
            EXPECT_TRUE(response.instances.empty());
        }
    }
}

}  // namespace
}  // namespace conformance

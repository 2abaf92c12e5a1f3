// The embedded broker against a provider written in plain C, as C providers
// for sfcb are, and against its twin on the binding: both must hand over
// exactly the objects of conformance_samples.h, every value with its type and
// text as CMPI_string whichever way it was passed, and both must read keys in
// the form the broker hands them to a C provider.
#include <string>
#include <vector>

#include "ConformanceFixture.h"
#include "model/PathText.h"

namespace conformance {
namespace {

TEST_F(ConformanceTest, BothProvidersHandOverEveryValueAsTheSamplesSetIt) {
    for (const Served &provider : {kCProvider, kTwin}) {
        SCOPED_TRACE(provider.sample);
        const std::vector<Instance> samples = expectedSamples(provider.sample);
        const Instance peer = expectedPeer(provider);
        expectSameInstances(enumerate(provider.sample), samples);
        expectSameInstances(enumerate(provider.peer), {peer});
        expectSamePaths(enumerateNames(provider.sample), samples);
        expectSamePaths(enumerateNames(provider.peer), {peer});
    }
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
        std::vector<Instance> expected = expectedSamples(provider.sample);
        expected.push_back(expectedPeer(provider));
        std::vector<Instance> found;
        for (const Instance &instance : expected) {
            Response response = broker.getInstance(instance.path, std::nullopt);
            EXPECT_TRUE(response.ok()) << response.message.value_or("");
            found.insert(found.end(), response.instances.begin(), response.instances.end());
        }
        expectSameInstances(found, expected);

        const ObjectPath &first = expected.front().path;
        const ObjectPath &peer = expected.back().path;
        std::string label = conf_samples[0].label;
        ++label.back();
        const ObjectPath misses[] = {
            withKey(first, "Label", CimValue::makeString(label)),  // a text key read only in part
            withKey(first, "Slot", CimValue::makeUnsigned(CMPI_uint16, conf_samples[1].slot)),
            withKey(withKey(peer, "Antecedent", *peer.key("Dependent")), "Dependent", *peer.key("Antecedent")),
        };
        for (const ObjectPath &miss : misses) {
            const Response response = broker.getInstance(miss, std::nullopt);
            EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_FOUND) << formatPath(miss);
            EXPECT_TRUE(response.instances.empty());
        }
    }
}

}  // namespace
}  // namespace conformance

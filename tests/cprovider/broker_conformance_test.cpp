// The embedded broker against a provider written in plain C, as C providers
// for sfcb are: a client sees exactly the objects of conformance_samples.h,
// every value with its type and text as CMPI_string whichever way it was
// passed, and the provider reads each key of a client's path in the form the
// broker hands it to a C provider.
#include <string>
#include <vector>

#include "ConformanceFixture.h"
#include "model/PathText.h"

namespace conformance {
namespace {

TEST_F(ConformanceTest, ClientsSeeEveryValueAsTheCProviderSetIt) {
    const std::vector<Instance> expected = expectedObjects();
    std::vector<Instance> enumerated;
    std::vector<ObjectPath> names;
    std::vector<ObjectPath> expectedNames;
    for (const char *cls : {kSampleClass, kPeerClass}) {
        const Response all = broker.enumInstances(ObjectPath{"", kNs, cls, {}}, std::nullopt);
        const Response paths = broker.enumInstanceNames(ObjectPath{"", kNs, cls, {}});
        EXPECT_TRUE(all.ok() && paths.ok()) << cls << ": " << all.message.value_or(paths.message.value_or(""));
        enumerated.insert(enumerated.end(), all.instances.begin(), all.instances.end());
        names.insert(names.end(), paths.paths.begin(), paths.paths.end());
    }
    std::vector<Instance> found;
    for (const Instance &object : expected) {
        expectedNames.push_back(object.path);
        const Response response = broker.getInstance(object.path, std::nullopt);
        EXPECT_TRUE(response.ok()) << formatPath(object.path) << ": " << response.message.value_or("");
        found.insert(found.end(), response.instances.begin(), response.instances.end());
    }
    EXPECT_EQ(describe(enumerated), describe(expected));
    EXPECT_EQ(describe(names), describe(expectedNames));
    EXPECT_EQ(describe(found), describe(expected));
}

}  // namespace
}  // namespace conformance

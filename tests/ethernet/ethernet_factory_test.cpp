// The shipped library's entry points: the only exported symbols are the
// factories, and the two Ethernet port factories hand out one provider.
#include <dlfcn.h>

#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "core/Broker.h"

namespace {

using InstanceFactory = CMPIInstanceMI *(*)(const CMPIBroker *, const CMPIContext *, CMPIStatus *);
using AssociationFactory = CMPIAssociationMI *(*)(const CMPIBroker *, const CMPIContext *, CMPIStatus *);

struct LibraryCloser {
    void operator()(void *library) const { ::dlclose(library); }
};

TEST(EthernetFactories, BothInterfacesShareOneProviderAndOnlyTheInstanceOneAnnouncesIt) {
    tvxbroker::Broker broker{tvxbroker::BrokerConfig{}};
    const std::string path = std::string(TVX_PROVIDER_DIR) + "/libtvxprovider.so";
    std::unique_ptr<void, LibraryCloser> library(::dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL));
    ASSERT_TRUE(library) << ::dlerror();
    auto createAssociation = reinterpret_cast<AssociationFactory>(
        ::dlsym(library.get(), "EthernetPortProvider_Create_AssociationMI"));
    auto createInstance = reinterpret_cast<InstanceFactory>(
        ::dlsym(library.get(), "EthernetPortProvider_Create_InstanceMI"));
    ASSERT_TRUE(createAssociation && createInstance);
    const CMPIContext *ctx = broker.newContext("root/cimv2");

    testing::internal::CaptureStderr();
    CMPIAssociationMI *association = createAssociation(broker.cmpiBroker(), ctx, nullptr);
    const std::string afterAssociation = testing::internal::GetCapturedStderr();
    testing::internal::CaptureStderr();
    CMPIInstanceMI *first = createInstance(broker.cmpiBroker(), ctx, nullptr);
    CMPIInstanceMI *second = createInstance(broker.cmpiBroker(), ctx, nullptr);
    const std::string afterInstances = testing::internal::GetCapturedStderr();

    EXPECT_EQ(afterAssociation, "");
    const std::string line = "--- _Create_InstanceMI() P10CmpiBaseMI\n";
    EXPECT_EQ(afterInstances, line + line);
    EXPECT_EQ(first, second);
    EXPECT_EQ(first->hdl, association->hdl);
    EXPECT_STREQ(first->ft->miName, "instanceEthernetPortProvider");
    EXPECT_STREQ(association->ft->miName, "associationEthernetPortProvider");

    // Three uses, three releases: the provider is gone only after the last.
    for (int i = 0; i < 2; ++i) EXPECT_EQ(first->ft->cleanup(first, ctx, true).rc, CMPI_RC_OK);
    EXPECT_EQ(association->ft->cleanup(association, ctx, true).rc, CMPI_RC_OK);
    broker.shutdown();
}

}  // namespace

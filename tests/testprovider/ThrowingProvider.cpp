// A provider that cannot be built: its constructor throws, the factory lets
// the status out, and the broker has to absorb it.
#include "CmpiProviderFactory.h"
#include "TestProvider.h"

namespace {

class ThrowingProvider : public testprovider::InstanceProvider {
public:
    ThrowingProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx, testprovider::ProviderClass::Throwing) {
        // The message leaves the provider unnamed: naming it is the broker's job.
        throw CmpiStatus(CMPI_RC_ERR_FAILED, "construction refused");
    }
};

}  // namespace

CMProviderBase(ThrowingProvider);
CMInstanceMIFactory(ThrowingProvider, ThrowingProvider)

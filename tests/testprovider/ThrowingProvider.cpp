// A provider that cannot be built: its constructor throws, the factory lets
// the status out, and the broker has to absorb it.
#include "CmpiProviderFactory.h"

namespace {

class ThrowingProvider : public CmpiInstanceMI {
public:
    ThrowingProvider(const CmpiBroker &mb, const CmpiContext &ctx) : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {
        // The message leaves the provider unnamed: naming it is the broker's job.
        throw CmpiStatus(CMPI_RC_ERR_FAILED, "construction refused");
    }
};

}  // namespace

CMProviderBase(ThrowingProvider);
CMInstanceMIFactory(ThrowingProvider, ThrowingProvider)

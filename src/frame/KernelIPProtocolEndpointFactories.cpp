// The kernel IP endpoint provider keeps no state of its own: it lives here,
// beside its one factory, and hands every request to the endpoint requests.
#include "CmpiProviderFactory.h"
#include "CmpiResultFilters.h"
#include "kernelip/EndpointRequests.h"

namespace {

class KernelIPProtocolEndpointProvider : public CmpiInstanceMI {
public:
    KernelIPProtocolEndpointProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}
    ~KernelIPProtocolEndpointProvider() override = default;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override {
        CmpiResultInstanceToPathFilter paths(rslt);
        return enumInstances(ctx, paths, cop, nullptr);
    }

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        return TVX::enumEndpoints(ctx, rslt, cop, properties, getBroker());
    }

    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        return TVX::getEndpoint(ctx, rslt, cop, properties, getBroker());
    }
};

}  // namespace

CMProviderBase(KernelIPProtocolEndpointProvider);

CMInstanceMIFactory(KernelIPProtocolEndpointProvider, KernelIPProtocolEndpointProvider)

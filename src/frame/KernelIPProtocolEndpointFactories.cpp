// The kernel IP endpoint provider keeps no state of its own: it lives here,
// beside its one factory, and hands every request to the endpoint requests.
#include "CmpiProviderFactory.h"
#include "frame/ForwardingInstanceProvider.h"
#include "kernelip/EndpointRequests.h"

namespace {

class KernelIPProtocolEndpointProvider
    : public frame::ForwardingInstanceProvider<TVX::enumEndpoints, TVX::getEndpoint> {
public:
    KernelIPProtocolEndpointProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), ForwardingInstanceProvider(mb, ctx) {}
};

}  // namespace

CMProviderBase(KernelIPProtocolEndpointProvider);

CMInstanceMIFactory(KernelIPProtocolEndpointProvider, KernelIPProtocolEndpointProvider)

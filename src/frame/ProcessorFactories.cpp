// The processor provider keeps no state of its own: it lives here, beside its
// one factory, and hands every request to the processor requests.
#include "CmpiProviderFactory.h"
#include "frame/ForwardingInstanceProvider.h"
#include "processor/ProcessorRequests.h"

namespace {

class TalvexProcessorProvider
    : public frame::ForwardingInstanceProvider<Processor::enumProcessors, Processor::getProcessor> {
public:
    TalvexProcessorProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), ForwardingInstanceProvider(mb, ctx) {}
};

}  // namespace

CMProviderBase(TalvexProcessorProvider);

CMInstanceMIFactory(TalvexProcessorProvider, TalvexProcessorProvider)

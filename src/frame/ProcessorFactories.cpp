// The processor provider keeps no state of its own: it lives here, beside its
// one factory, and hands every request to the processor requests.
#include "CmpiProviderFactory.h"
#include "CmpiResultFilters.h"
#include "processor/ProcessorRequests.h"

namespace {

class TalvexProcessorProvider : public CmpiInstanceMI {
public:
    TalvexProcessorProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}
    ~TalvexProcessorProvider() override = default;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override {
        CmpiResultInstanceToPathFilter paths(rslt);
        return enumInstances(ctx, paths, cop, nullptr);
    }

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        return Processor::enumProcessors(ctx, rslt, cop, properties, getBroker());
    }

    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        return Processor::getProcessor(ctx, rslt, cop, properties, getBroker());
    }
};

}  // namespace

CMProviderBase(TalvexProcessorProvider);

CMInstanceMIFactory(TalvexProcessorProvider, TalvexProcessorProvider)

// Serves Test_ProviderStats: for the providers whose objects the broker tests
// watch, how often those objects were initialized and how many interfaces
// their base objects have handed out.
#include <array>

#include "CmpiProviderFactory.h"
#include "TestProvider.h"

extern CmpiProviderBase baseWidgetGadgetProvider;
extern CmpiProviderBase baseEventProvider;
extern CmpiProviderBase baseEventStore;

namespace {

using namespace testprovider;

struct ProviderRow {
    const char *name;
    std::array<const CmpiProviderBase *, 2> bases;  // unused entries are null
};

const ProviderRow kProviders[] = {
    {"WidgetGadgetProvider", {&baseWidgetGadgetProvider}},
    {"EventProvider", {&baseEventProvider, &baseEventStore}},
};

class StatsProvider : public InstanceProvider {
public:
    StatsProvider(const CmpiBroker &mb, const CmpiContext &ctx) : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx) {}

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        for (const ProviderRow &row : kProviders) {
            CMPIUint32 initialized = 0;
            CMPISint32 uses = 0;
            for (const CmpiProviderBase *base : row.bases) {
                if (base == nullptr) continue;
                uses += base->getUseCount();
                const auto *provider = dynamic_cast<const InstanceProvider *>(base->getBaseMI());
                if (provider != nullptr) initialized += provider->initializations.load();
            }
            CmpiObjectPath path(cop.getNameSpace(), "Test_ProviderStats");
            path.setKey("ProviderName", row.name);
            CmpiInstance stats(path);
            stats.setPropertyFilter(properties, nullptr);
            stats.setProperty("ProviderName", row.name);
            stats.setProperty("Initialized", initialized);
            stats.setProperty("UseCount", uses);
            rslt.returnData(stats);
        }
        return done(rslt);
    }
};

}  // namespace

CMProviderBase(StatsProvider);
CMInstanceMIFactory(StatsProvider, StatsProvider)

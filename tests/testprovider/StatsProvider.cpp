// Serves Test_ProviderStats: one instance per provider class of this library,
// with its life counters and how many interfaces its base objects have handed
// out, so tests can see how the broker's factory calls shared the objects.
#include <array>

#include "CmpiProviderFactory.h"
#include "TestProvider.h"

extern CmpiProviderBase baseWidgetProvider;
extern CmpiProviderBase baseGadgetProvider;
extern CmpiProviderBase baseWidgetGadgetProvider;
extern CmpiProviderBase baseEventProvider;
extern CmpiProviderBase baseEventStore;
extern CmpiProviderBase baseThrowingProvider;

CMProviderBase(StatsProvider);

namespace {

using namespace testprovider;

struct ClassRow {
    const char *name;
    ProviderClass cls;
    std::array<const CmpiProviderBase *, 2> bases;  // unused entries are null
};

const ClassRow kClasses[] = {
    {"WidgetProvider", ProviderClass::Widget, {&baseWidgetProvider}},
    {"GadgetProvider", ProviderClass::Gadget, {&baseGadgetProvider}},
    {"WidgetGadgetProvider", ProviderClass::WidgetGadget, {&baseWidgetGadgetProvider}},
    {"EventProvider", ProviderClass::Event, {&baseEventProvider, &baseEventStore}},
    {"StatsProvider", ProviderClass::Stats, {&baseStatsProvider}},
    {"ThrowingProvider", ProviderClass::Throwing, {&baseThrowingProvider}},
};

CMPISint32 useCountOf(const ClassRow &row) {
    CMPISint32 uses = 0;
    for (const CmpiProviderBase *base : row.bases) {
        if (base != nullptr) uses += base->getUseCount();
    }
    return uses;
}

class StatsProvider : public InstanceProvider {
public:
    StatsProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx, ProviderClass::Stats) {}

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        for (const ClassRow &row : kClasses) {
            CmpiObjectPath path(cop.getNameSpace(), "Test_ProviderStats");
            path.setKey("ProviderName", row.name);
            CmpiInstance stats(path);
            stats.setPropertyFilter(properties, nullptr);
            const LifeCounts &life = lifeOf(row.cls);
            stats.setProperty("ProviderName", row.name);
            stats.setProperty("Constructed", CMPIUint32(life.constructed.load()));
            stats.setProperty("Initialized", CMPIUint32(life.initialized.load()));
            stats.setProperty("Destroyed", CMPIUint32(life.destroyed.load()));
            stats.setProperty("UseCount", useCountOf(row));
            rslt.returnData(stats);
        }
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
};

}  // namespace

CMInstanceMIFactory(StatsProvider, StatsProvider)

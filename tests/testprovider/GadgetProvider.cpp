// Serves Test_Gadget with no data of its own: there is one gadget per widget,
// and every answer asks the widget provider through the broker, so both
// up-calls and the path-to-instance result filter are exercised.
#include <string>

#include "CmpiProviderFactory.h"
#include "TestProvider.h"

namespace {

using namespace testprovider;

class GadgetProvider : public InstanceProvider {
public:
    GadgetProvider(const CmpiBroker &mb, const CmpiContext &ctx) : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx) {}

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop) override {
        const CmpiString ns = cop.getNameSpace();
        const CmpiEnumeration widgets = broker.enumInstanceNames(ctx, CmpiObjectPath(ns, kWidgetClass));
        while (widgets.hasNext()) {
            const CmpiObjectPath widget = widgets.getNext();
            rslt.returnData(gadgetPath(ns, stringKey(widget, "Name")));
        }
        return done(rslt);
    }

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        CmpiResultPathToInstanceFilter instances(rslt, ctx, properties, this);
        return enumInstanceNames(ctx, instances, cop);
    }

    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        const CmpiString ns = cop.getNameSpace();
        const std::string id = stringKey(cop, "Id");
        const std::string widgetName = widgetNameOf(id);
        // Throws the widget provider's own status when there is no such widget.
        broker.getInstance(ctx, widgetPath(ns, widgetName), nullptr);
        CmpiInstance gadget(gadgetPath(ns, widgetName));
        gadget.setPropertyFilter(properties, nullptr);
        gadget.setProperty("Id", id);
        gadget.setProperty("WidgetName", widgetName);
        rslt.returnData(gadget);
        return done(rslt);
    }
};

}  // namespace

CMProviderBase(GadgetProvider);
CMInstanceMIFactory(GadgetProvider, GadgetProvider)

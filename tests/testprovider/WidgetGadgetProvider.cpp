// Serves the association Test_WidgetGadget, which ties each widget (Owner)
// to its gadget (Part), through both interfaces of one object: the instance
// side enumerates the links, the association side walks them from either
// end, naming what it finds through the instance-to-path filter. The widget
// end is always resolved through an up-call, so it carries the class the
// widget provider gives it (Test_SpecialWidget for gamma).
#include <optional>
#include <string>

#include "CmpiProviderFactory.h"
#include "TestProvider.h"

namespace {

using namespace testprovider;

constexpr const char *kLinkClass = "Test_WidgetGadget";

bool unfiltered(const char *filter) { return filter == nullptr || *filter == '\0'; }

bool roleMatches(const char *filter, const char *role) {
    return unfiltered(filter) || CmpiString(filter).equalsIgnoreCase(role);
}

bool classMatches(const CmpiObjectPath &path, const char *filter) {
    return unfiltered(filter) || path.classPathIsA(filter);
}

// One link, seen from the end a traversal started at.
struct Link {
    CmpiString ns;
    CmpiObjectPath widget;
    CmpiObjectPath gadget;
    bool fromWidget;

    const CmpiObjectPath &far() const { return fromWidget ? gadget : widget; }

    CmpiInstance instance(const char **properties) const {
        CmpiObjectPath path(ns, kLinkClass);
        path.setKey("Owner", widget);
        path.setKey("Part", gadget);
        CmpiInstance link(path);
        link.setPropertyFilter(properties, nullptr);
        link.setProperty("Owner", widget);
        link.setProperty("Part", gadget);
        return link;
    }

    bool passes(const char *assocClass, const char *role) const {
        return roleMatches(role, fromWidget ? "Owner" : "Part") &&
               classMatches(CmpiObjectPath(ns, kLinkClass), assocClass);
    }

    bool reaches(const char *resultClass, const char *resultRole) const {
        return roleMatches(resultRole, fromWidget ? "Part" : "Owner") && classMatches(far(), resultClass);
    }
};

class WidgetGadgetProvider : public InstanceProvider, public CmpiAssociationMI {
public:
    WidgetGadgetProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx), CmpiAssociationMI(mb, ctx) {}

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        const CmpiString ns = cop.getNameSpace();
        const CmpiEnumeration widgets = broker.enumInstanceNames(ctx, CmpiObjectPath(ns, kWidgetClass));
        while (widgets.hasNext()) {
            const CmpiObjectPath widget = widgets.getNext();
            const Link link{ns, widget, gadgetPath(ns, stringKey(widget, "Name")), true};
            rslt.returnData(link.instance(properties));
        }
        return done(rslt);
    }

    CmpiStatus references(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op, const char *resultClass,
                          const char *role, const char **properties) override {
        const std::optional<Link> link = linkOf(ctx, op);
        if (link && link->passes(resultClass, role)) rslt.returnData(link->instance(properties));
        return done(rslt);
    }

    CmpiStatus referenceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                              const char *resultClass, const char *role) override {
        CmpiResultInstanceToPathFilter names(rslt);
        return references(ctx, names, op, resultClass, role, nullptr);
    }

    CmpiStatus associators(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op, const char *assocClass,
                           const char *resultClass, const char *role, const char *resultRole,
                           const char **properties) override {
        const std::optional<Link> link = linkOf(ctx, op);
        if (link && link->passes(assocClass, role) && link->reaches(resultClass, resultRole)) {
            rslt.returnData(broker.getInstance(ctx, link->far(), properties));
        }
        return done(rslt);
    }

    CmpiStatus associatorNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                               const char *assocClass, const char *resultClass, const char *role,
                               const char *resultRole) override {
        CmpiResultInstanceToPathFilter names(rslt);
        return associators(ctx, names, op, assocClass, resultClass, role, resultRole, nullptr);
    }

private:
    // The link `op` is an end of; none for a path of any other class. An
    // unknown widget fails with the widget provider's status.
    std::optional<Link> linkOf(const CmpiContext &ctx, const CmpiObjectPath &op) const {
        const bool fromWidget = op.classPathIsA(kWidgetClass);
        if (!fromWidget && !op.classPathIsA(kGadgetClass)) return std::nullopt;
        const CmpiString ns = op.getNameSpace();
        const std::string name = fromWidget ? stringKey(op, "Name") : widgetNameOf(stringKey(op, "Id"));
        const CmpiInstance widget = broker.getInstance(ctx, widgetPath(ns, name), nullptr);
        return Link{ns, widget.getObjectPath(), gadgetPath(ns, name), fromWidget};
    }
};

}  // namespace

CMProviderBase(WidgetGadgetProvider);
CMInstanceMIFactory(WidgetGadgetProvider, WidgetGadgetProvider)
CMAssociationMIFactory(WidgetGadgetProvider, WidgetGadgetProvider)

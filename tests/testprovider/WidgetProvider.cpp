// Serves Test_Widget and Test_SpecialWidget from fixed data. The operations
// it does not serve each fail in their own way, so a test can tell that the
// status, whatever its source, reaches the caller unchanged.
#include <algorithm>
#include <stdexcept>
#include <string>

#include "CmpiArray.h"
#include "CmpiProviderFactory.h"
#include "TestProvider.h"

namespace {

using namespace testprovider;

struct Widget {
    const char *name;
    const char *className;
    CMPIUint32 size;
    bool enabled;
};

constexpr Widget kWidgets[] = {
    {"alpha", "Test_Widget", 1, true},
    {"beta", "Test_Widget", 2, false},
    {"gamma", "Test_SpecialWidget", 3, true},
};

CmpiInstance makeWidget(const CmpiString &ns, const Widget &widget, const char **properties) {
    CmpiObjectPath path(ns, widget.className);
    path.setKey("Name", widget.name);
    CmpiInstance inst(path);
    inst.setPropertyFilter(properties, nullptr);
    inst.setProperty("Name", widget.name);
    inst.setProperty("Size", widget.size);
    CmpiArray tags(2, CMPI_string);
    tags[0] = "test";
    tags[1] = widget.name;
    inst.setProperty("Tags", tags);
    inst.setProperty("Enabled", widget.enabled);
    return inst;
}

class WidgetProvider : public InstanceProvider {
public:
    WidgetProvider(const CmpiBroker &mb, const CmpiContext &ctx) : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx) {}

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        const CmpiString ns = cop.getNameSpace();
        const CmpiString requested = cop.getClassName();
        for (const Widget &widget : kWidgets) {
            // The broker asks once per registered class, subclasses included.
            if (requested.equalsIgnoreCase(widget.className)) {
                rslt.returnData(makeWidget(ns, widget, properties));
            }
        }
        return done(rslt);
    }

    CmpiStatus getInstance(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        const std::string name = stringKey(cop, "Name");
        // As the product's providers answer for an object they do not have.
        if (name == kVanishingWidget) return CmpiStatus(CMPI_RC_OK);
        const auto found = std::find_if(std::begin(kWidgets), std::end(kWidgets),
                                        [&](const Widget &widget) { return name == widget.name; });
        if (found == std::end(kWidgets)) {
            return CmpiStatus(CMPI_RC_ERR_NOT_FOUND, ("no widget " + name).c_str());
        }
        rslt.returnData(makeWidget(cop.getNameSpace(), *found, properties));
        return done(rslt);
    }

    CmpiStatus createInstance(const CmpiContext &, CmpiResult &, const CmpiObjectPath &,
                              const CmpiInstance &) override {
        throw CmpiStatus(CMPI_RC_ERR_ALREADY_EXISTS, "widget exists");
    }

    CmpiStatus setInstance(const CmpiContext &, CmpiResult &, const CmpiObjectPath &, const CmpiInstance &,
                           const char **) override {
        throw std::runtime_error("set failed");
    }

    // Something that is no exception class at all must still become a status.
    CmpiStatus execQuery(const CmpiContext &, CmpiResult &, const CmpiObjectPath &, const char *,
                         const char *) override {
        throw 42;
    }
};

}  // namespace

CMProviderBase(WidgetProvider);
CMInstanceMIFactory(WidgetProvider, WidgetProvider)

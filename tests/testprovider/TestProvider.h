// What the test providers share: the names they serve, the rule that ties a
// gadget to its widget, key reading, ending an answer, and the base of every
// instance provider.
#pragma once

#include <string>

#include "CmpiResultFilters.h"

namespace testprovider {

inline constexpr const char *kWidgetClass = "Test_Widget";
inline constexpr const char *kGadgetClass = "Test_Gadget";
inline constexpr const char *kGadgetPrefix = "gadget-";
// The widget whose getInstance answers OK with nothing.
inline constexpr const char *kVanishingWidget = "vanishing";

// The text of a string key; a missing or null key is the caller's mistake.
inline std::string stringKey(const CmpiObjectPath &path, const char *key) {
    const CmpiData value = path.getKey(key);
    const char *text = value.isNotFound() || value.isNullValue() ? nullptr : static_cast<const char *>(value);
    if (text == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_INVALID_PARAMETER, (std::string(key) + " key missing").c_str());
    }
    return text;
}

// Ends a successful answer.
inline CmpiStatus done(CmpiResult &rslt) {
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

inline CmpiObjectPath widgetPath(const CmpiString &ns, const std::string &name) {
    CmpiObjectPath path(ns, kWidgetClass);
    path.setKey("Name", name);
    return path;
}

inline CmpiObjectPath gadgetPath(const CmpiString &ns, const std::string &widgetName) {
    CmpiObjectPath path(ns, kGadgetClass);
    path.setKey("Id", kGadgetPrefix + widgetName);
    return path;
}

inline std::string widgetNameOf(const std::string &gadgetId) {
    const std::string prefix = kGadgetPrefix;
    if (gadgetId.compare(0, prefix.size(), prefix) != 0) {
        throw CmpiStatus(CMPI_RC_ERR_NOT_FOUND, ("no gadget " + gadgetId).c_str());
    }
    return gadgetId.substr(prefix.size());
}

// An instance provider of this library: it names its instances by the paths
// of what its own enumInstances returns.
class InstanceProvider : public CmpiInstanceMI {
public:
    InstanceProvider(const CmpiBroker &mb, const CmpiContext &ctx) : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop) override {
        CmpiResultInstanceToPathFilter names(rslt);
        return enumInstances(ctx, names, cop, nullptr);
    }
};

}  // namespace testprovider

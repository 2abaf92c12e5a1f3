// What the test providers share: the names they serve, the rule that ties a
// gadget to its widget, key reading, and the life counters StatsProvider
// reports for every provider class of this library.
#pragma once

#include <array>
#include <atomic>
#include <cstddef>
#include <string>

#include "CmpiResultFilters.h"

namespace testprovider {

inline constexpr const char *kWidgetClass = "Test_Widget";
inline constexpr const char *kGadgetClass = "Test_Gadget";
inline constexpr const char *kGadgetPrefix = "gadget-";

// The text of a string key; a missing or null key is the caller's mistake.
inline std::string stringKey(const CmpiObjectPath &path, const char *key) {
    const CmpiData value = path.getKey(key);
    const char *text = value.isNotFound() || value.isNullValue() ? nullptr
                                                                 : static_cast<const char *>(value);
    if (text == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_INVALID_PARAMETER, (std::string(key) + " key missing").c_str());
    }
    return text;
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

enum class ProviderClass : std::size_t { Widget, Gadget, WidgetGadget, Event, Stats, Throwing, Count };

struct LifeCounts {
    std::atomic<unsigned> constructed{0};
    std::atomic<unsigned> initialized{0};
    std::atomic<unsigned> destroyed{0};
};

inline LifeCounts &lifeOf(ProviderClass cls) {
    static std::array<LifeCounts, static_cast<std::size_t>(ProviderClass::Count)> counts;
    return counts[static_cast<std::size_t>(cls)];
}

// Every provider class derives from this, so the factories' object sharing
// and single initialization can be observed from outside.
class CountedProvider : public virtual CmpiBaseMI {
public:
    CountedProvider(const CmpiBroker &mb, const CmpiContext &ctx, ProviderClass cls)
        : CmpiBaseMI(mb, ctx), lifeCounts(lifeOf(cls)) {
        ++lifeCounts.constructed;
    }
    ~CountedProvider() override { ++lifeCounts.destroyed; }

    CmpiStatus initialize(const CmpiContext &) override {
        ++lifeCounts.initialized;
        return CmpiStatus(CMPI_RC_OK);
    }

private:
    LifeCounts &lifeCounts;
};

// An instance provider of this library: counted, and naming its instances
// by the paths of what its own enumInstances returns.
class InstanceProvider : public CmpiInstanceMI, public CountedProvider {
public:
    InstanceProvider(const CmpiBroker &mb, const CmpiContext &ctx, ProviderClass cls)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), CountedProvider(mb, ctx, cls) {}

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override {
        CmpiResultInstanceToPathFilter names(rslt);
        return enumInstances(ctx, names, cop, nullptr);
    }
};

}  // namespace testprovider

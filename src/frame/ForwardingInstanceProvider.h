// An instance provider without state of its own: enumerations and gets go
// to two request functions, names are the enumerated instances' paths, and
// every other operation keeps the binding's answer.
#pragma once

#include "CmpiInstanceMI.h"
#include "CmpiResultFilters.h"

namespace frame {

using InstanceRequest = CmpiStatus (*)(const CmpiContext &, CmpiResult &, const CmpiObjectPath &,
                                       const char **, CmpiBroker *);

template <InstanceRequest enumerate, InstanceRequest get>
class ForwardingInstanceProvider : public CmpiInstanceMI {
public:
    ForwardingInstanceProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}
    ~ForwardingInstanceProvider() override = default;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override {
        CmpiResultInstanceToPathFilter paths(rslt);
        return enumInstances(ctx, paths, cop, nullptr);
    }

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        return enumerate(ctx, rslt, cop, properties, getBroker());
    }

    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        return get(ctx, rslt, cop, properties, getBroker());
    }
};

}  // namespace frame

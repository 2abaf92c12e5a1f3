#include "CmpiIndicationMI.h"

#include "BindingSupport.h"

namespace {

template <class Operation>
CMPIStatus onIndicationSide(const CMPIIndicationMI *mi, Operation &&operation) {
    CmpiBaseMI *provider = cmpibinding::providerOf(mi);
    if (provider == nullptr || provider->indicationMI() == nullptr) {
        return cmpibinding::invalidHandle();
    }
    return cmpibinding::runOperation(provider,
                                     [&] { return operation(*provider->indicationMI()); });
}

}  // namespace

CmpiIndicationMI::CmpiIndicationMI(const CmpiBroker &mbp, const CmpiContext &ctx)
    : CmpiBaseMI(mbp, ctx) {
    indicationKind = this;
}

CmpiStatus CmpiIndicationMI::authorizeFilter(const CmpiContext &, const CmpiSelectExp &,
                                             const char *, const CmpiObjectPath &,
                                             const char *) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiIndicationMI::mustPoll(const CmpiContext &, const CmpiSelectExp &, const char *,
                                      const CmpiObjectPath &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiIndicationMI::activateFilter(const CmpiContext &, const CmpiSelectExp &,
                                            const char *, const CmpiObjectPath &, bool) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiIndicationMI::deActivateFilter(const CmpiContext &, const CmpiSelectExp &,
                                              const char *, const CmpiObjectPath &, bool) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiIndicationMI::enableIndications(const CmpiContext &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiIndicationMI::disableIndications(const CmpiContext &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CmpiIndicationMI::driveAuthorizeFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                                  const CMPISelectExp *filter,
                                                  const char *className,
                                                  const CMPIObjectPath *op, const char *owner) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.authorizeFilter(CmpiContext(ctx), CmpiSelectExp(filter), className,
                                        CmpiObjectPath(op), owner);
    });
}

CMPIStatus CmpiIndicationMI::driveMustPoll(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                           const CMPISelectExp *filter, const char *className,
                                           const CMPIObjectPath *op) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.mustPoll(CmpiContext(ctx), CmpiSelectExp(filter), className,
                                 CmpiObjectPath(op));
    });
}

CMPIStatus CmpiIndicationMI::driveActivateFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                                 const CMPISelectExp *filter,
                                                 const char *className, const CMPIObjectPath *op,
                                                 CMPIBoolean firstActivation) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.activateFilter(CmpiContext(ctx), CmpiSelectExp(filter), className,
                                       CmpiObjectPath(op), firstActivation != 0);
    });
}

CMPIStatus CmpiIndicationMI::driveDeActivateFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                                   const CMPISelectExp *filter,
                                                   const char *className,
                                                   const CMPIObjectPath *op,
                                                   CMPIBoolean lastActivation) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.deActivateFilter(CmpiContext(ctx), CmpiSelectExp(filter), className,
                                         CmpiObjectPath(op), lastActivation != 0);
    });
}

CMPIStatus CmpiIndicationMI::driveEnableIndications(CMPIIndicationMI *mi,
                                                    const CMPIContext *ctx) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.enableIndications(CmpiContext(ctx));
    });
}

CMPIStatus CmpiIndicationMI::driveDisableIndications(CMPIIndicationMI *mi,
                                                     const CMPIContext *ctx) {
    return onIndicationSide(mi, [&](CmpiIndicationMI &provider) {
        return provider.disableIndications(CmpiContext(ctx));
    });
}

#include "CmpiInstanceMI.h"

#include "BindingSupport.h"

namespace {

// Runs an operation of the instance side of the provider behind `mi`.
template <class Operation>
CMPIStatus onInstanceSide(const CMPIInstanceMI *mi, Operation &&operation) {
    CmpiBaseMI *provider = cmpibinding::providerOf(mi);
    if (provider == nullptr || provider->instanceMI() == nullptr) {
        return cmpibinding::invalidHandle();
    }
    return cmpibinding::runOperation(provider,
                                     [&] { return operation(*provider->instanceMI()); });
}

}  // namespace

CmpiInstanceMI::CmpiInstanceMI(const CmpiBroker &mbp, const CmpiContext &ctx)
    : CmpiBaseMI(mbp, ctx) {
    instanceKind = this;
}

CmpiStatus CmpiInstanceMI::enumInstanceNames(const CmpiContext &, CmpiResult &,
                                             const CmpiObjectPath &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::enumInstances(const CmpiContext &, CmpiResult &,
                                         const CmpiObjectPath &, const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::getInstance(const CmpiContext &, CmpiResult &,
                                       const CmpiObjectPath &, const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::createInstance(const CmpiContext &, CmpiResult &,
                                          const CmpiObjectPath &, const CmpiInstance &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::setInstance(const CmpiContext &, CmpiResult &,
                                       const CmpiObjectPath &, const CmpiInstance &,
                                       const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::deleteInstance(const CmpiContext &, CmpiResult &,
                                          const CmpiObjectPath &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiInstanceMI::execQuery(const CmpiContext &, CmpiResult &, const CmpiObjectPath &,
                                     const char *, const char *) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CmpiInstanceMI::driveEnumInstanceNames(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                                  const CMPIResult *rslt,
                                                  const CMPIObjectPath *cop) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.enumInstanceNames(CmpiContext(ctx), result, CmpiObjectPath(cop));
    });
}

CMPIStatus CmpiInstanceMI::driveEnumInstances(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                              const CMPIResult *rslt, const CMPIObjectPath *cop,
                                              const char **properties) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.enumInstances(CmpiContext(ctx), result, CmpiObjectPath(cop), properties);
    });
}

CMPIStatus CmpiInstanceMI::driveGetInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                            const CMPIResult *rslt, const CMPIObjectPath *cop,
                                            const char **properties) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.getInstance(CmpiContext(ctx), result, CmpiObjectPath(cop), properties);
    });
}

CMPIStatus CmpiInstanceMI::driveCreateInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                               const CMPIResult *rslt, const CMPIObjectPath *cop,
                                               const CMPIInstance *inst) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.createInstance(CmpiContext(ctx), result, CmpiObjectPath(cop),
                                       CmpiInstance(inst));
    });
}

CMPIStatus CmpiInstanceMI::driveSetInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                            const CMPIResult *rslt, const CMPIObjectPath *cop,
                                            const CMPIInstance *inst, const char **properties) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.setInstance(CmpiContext(ctx), result, CmpiObjectPath(cop),
                                    CmpiInstance(inst), properties);
    });
}

CMPIStatus CmpiInstanceMI::driveDeleteInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                               const CMPIResult *rslt,
                                               const CMPIObjectPath *cop) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.deleteInstance(CmpiContext(ctx), result, CmpiObjectPath(cop));
    });
}

CMPIStatus CmpiInstanceMI::driveExecQuery(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                          const CMPIResult *rslt, const CMPIObjectPath *cop,
                                          const char *query, const char *language) {
    return onInstanceSide(mi, [&](CmpiInstanceMI &provider) {
        CmpiResult result(rslt);
        return provider.execQuery(CmpiContext(ctx), result, CmpiObjectPath(cop), language, query);
    });
}

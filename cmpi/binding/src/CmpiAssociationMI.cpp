#include "CmpiAssociationMI.h"

#include "BindingSupport.h"

namespace {

template <class Operation>
CMPIStatus onAssociationSide(const CMPIAssociationMI *mi, Operation &&operation) {
    CmpiBaseMI *provider = cmpibinding::providerOf(mi);
    if (provider == nullptr || provider->associationMI() == nullptr) {
        return cmpibinding::invalidHandle();
    }
    return cmpibinding::runOperation(provider,
                                     [&] { return operation(*provider->associationMI()); });
}

}  // namespace

CmpiAssociationMI::CmpiAssociationMI(const CmpiBroker &mbp, const CmpiContext &ctx)
    : CmpiBaseMI(mbp, ctx) {
    associationKind = this;
}

CmpiStatus CmpiAssociationMI::associators(const CmpiContext &, CmpiResult &,
                                          const CmpiObjectPath &, const char *, const char *,
                                          const char *, const char *, const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiAssociationMI::associatorNames(const CmpiContext &, CmpiResult &,
                                              const CmpiObjectPath &, const char *,
                                              const char *, const char *, const char *) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiAssociationMI::references(const CmpiContext &, CmpiResult &,
                                         const CmpiObjectPath &, const char *, const char *,
                                         const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus CmpiAssociationMI::referenceNames(const CmpiContext &, CmpiResult &,
                                             const CmpiObjectPath &, const char *,
                                             const char *) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CmpiAssociationMI::driveAssociators(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                               const CMPIResult *rslt, const CMPIObjectPath *op,
                                               const char *assocClass, const char *resultClass,
                                               const char *role, const char *resultRole,
                                               const char **properties) {
    return onAssociationSide(mi, [&](CmpiAssociationMI &provider) {
        CmpiResult result(rslt);
        return provider.associators(CmpiContext(ctx), result, CmpiObjectPath(op), assocClass,
                                    resultClass, role, resultRole, properties);
    });
}

CMPIStatus CmpiAssociationMI::driveAssociatorNames(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                                   const CMPIResult *rslt,
                                                   const CMPIObjectPath *op,
                                                   const char *assocClass,
                                                   const char *resultClass, const char *role,
                                                   const char *resultRole) {
    return onAssociationSide(mi, [&](CmpiAssociationMI &provider) {
        CmpiResult result(rslt);
        return provider.associatorNames(CmpiContext(ctx), result, CmpiObjectPath(op), assocClass,
                                        resultClass, role, resultRole);
    });
}

CMPIStatus CmpiAssociationMI::driveReferences(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                              const CMPIResult *rslt, const CMPIObjectPath *op,
                                              const char *resultClass, const char *role,
                                              const char **properties) {
    return onAssociationSide(mi, [&](CmpiAssociationMI &provider) {
        CmpiResult result(rslt);
        return provider.references(CmpiContext(ctx), result, CmpiObjectPath(op), resultClass,
                                   role, properties);
    });
}

CMPIStatus CmpiAssociationMI::driveReferenceNames(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                                  const CMPIResult *rslt,
                                                  const CMPIObjectPath *op,
                                                  const char *resultClass, const char *role) {
    return onAssociationSide(mi, [&](CmpiAssociationMI &provider) {
        CmpiResult result(rslt);
        return provider.referenceNames(CmpiContext(ctx), result, CmpiObjectPath(op), resultClass,
                                       role);
    });
}

// The association interface. Operations a provider does not override answer
// CMPI_RC_ERR_NOT_SUPPORTED.
#pragma once

#include "CmpiBaseMI.h"
#include "CmpiResult.h"

class CmpiAssociationMI : public virtual CmpiBaseMI {
public:
    CmpiAssociationMI(const CmpiBroker &broker, const CmpiContext &ctx);
    // First among the virtual functions, so that a provider's slots begin
    // with the destructor pair (complete, deleting) and then the operations.
    ~CmpiAssociationMI() override = default;

    virtual CmpiStatus associators(const CmpiContext &ctx, CmpiResult &rslt,
                                   const CmpiObjectPath &op, const char *assocClass,
                                   const char *resultClass, const char *role,
                                   const char *resultRole, const char **properties);
    virtual CmpiStatus associatorNames(const CmpiContext &ctx, CmpiResult &rslt,
                                       const CmpiObjectPath &op, const char *assocClass,
                                       const char *resultClass, const char *role,
                                       const char *resultRole);
    virtual CmpiStatus references(const CmpiContext &ctx, CmpiResult &rslt,
                                  const CmpiObjectPath &op, const char *resultClass,
                                  const char *role, const char **properties);
    virtual CmpiStatus referenceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                      const CmpiObjectPath &op, const char *resultClass,
                                      const char *role);

    static CMPIStatus driveAssociators(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                       const CMPIResult *rslt, const CMPIObjectPath *op,
                                       const char *assocClass, const char *resultClass,
                                       const char *role, const char *resultRole,
                                       const char **properties);
    static CMPIStatus driveAssociatorNames(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                           const CMPIResult *rslt, const CMPIObjectPath *op,
                                           const char *assocClass, const char *resultClass,
                                           const char *role, const char *resultRole);
    static CMPIStatus driveReferences(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                      const CMPIResult *rslt, const CMPIObjectPath *op,
                                      const char *resultClass, const char *role,
                                      const char **properties);
    static CMPIStatus driveReferenceNames(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                          const CMPIResult *rslt, const CMPIObjectPath *op,
                                          const char *resultClass, const char *role);
};

// The instance interface. Operations a provider does not override answer
// CMPI_RC_ERR_NOT_SUPPORTED.
#pragma once

#include "CmpiBaseMI.h"
#include "CmpiResult.h"

class CmpiInstanceMI : public virtual CmpiBaseMI {
public:
    CmpiInstanceMI(const CmpiBroker &broker, const CmpiContext &ctx);
    // First among the virtual functions, so that a provider's slots begin
    // with the destructor pair (complete, deleting) and then the operations.
    ~CmpiInstanceMI() override = default;

    virtual CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                         const CmpiObjectPath &cop);
    virtual CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt,
                                     const CmpiObjectPath &cop, const char **properties);
    virtual CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt,
                                   const CmpiObjectPath &cop, const char **properties);
    virtual CmpiStatus createInstance(const CmpiContext &ctx, CmpiResult &rslt,
                                      const CmpiObjectPath &cop, const CmpiInstance &inst);
    virtual CmpiStatus setInstance(const CmpiContext &ctx, CmpiResult &rslt,
                                   const CmpiObjectPath &cop, const CmpiInstance &inst,
                                   const char **properties);
    virtual CmpiStatus deleteInstance(const CmpiContext &ctx, CmpiResult &rslt,
                                      const CmpiObjectPath &cop);
    virtual CmpiStatus execQuery(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop, const char *language,
                                 const char *query);

    static CMPIStatus driveEnumInstanceNames(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                             const CMPIResult *rslt, const CMPIObjectPath *cop);
    static CMPIStatus driveEnumInstances(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                         const CMPIResult *rslt, const CMPIObjectPath *cop,
                                         const char **properties);
    static CMPIStatus driveGetInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                       const CMPIResult *rslt, const CMPIObjectPath *cop,
                                       const char **properties);
    static CMPIStatus driveCreateInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                          const CMPIResult *rslt, const CMPIObjectPath *cop,
                                          const CMPIInstance *inst);
    static CMPIStatus driveSetInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                       const CMPIResult *rslt, const CMPIObjectPath *cop,
                                       const CMPIInstance *inst, const char **properties);
    static CMPIStatus driveDeleteInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                          const CMPIResult *rslt, const CMPIObjectPath *cop);
    static CMPIStatus driveExecQuery(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                     const CMPIResult *rslt, const CMPIObjectPath *cop,
                                     const char *query, const char *language);
};

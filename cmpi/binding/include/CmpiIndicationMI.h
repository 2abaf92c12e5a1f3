// The indication interface. Operations a provider does not override answer
// CMPI_RC_ERR_NOT_SUPPORTED.
#pragma once

#include "CmpiBaseMI.h"
#include "CmpiSelectExp.h"

class CmpiIndicationMI : public virtual CmpiBaseMI {
public:
    CmpiIndicationMI(const CmpiBroker &broker, const CmpiContext &ctx);
    // First among the virtual functions, so that a provider's slots begin
    // with the destructor pair (complete, deleting) and then the operations.
    ~CmpiIndicationMI() override = default;

    virtual CmpiStatus authorizeFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                       const char *className, const CmpiObjectPath &op,
                                       const char *owner);
    virtual CmpiStatus mustPoll(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                const char *className, const CmpiObjectPath &op);
    virtual CmpiStatus activateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                      const char *className, const CmpiObjectPath &op,
                                      bool firstActivation);
    virtual CmpiStatus deActivateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                        const char *className, const CmpiObjectPath &op,
                                        bool lastActivation);
    virtual CmpiStatus enableIndications(const CmpiContext &ctx);
    virtual CmpiStatus disableIndications(const CmpiContext &ctx);

    static CMPIStatus driveAuthorizeFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                           const CMPISelectExp *filter, const char *className,
                                           const CMPIObjectPath *op, const char *owner);
    static CMPIStatus driveMustPoll(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                    const CMPISelectExp *filter, const char *className,
                                    const CMPIObjectPath *op);
    static CMPIStatus driveActivateFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                          const CMPISelectExp *filter, const char *className,
                                          const CMPIObjectPath *op, CMPIBoolean firstActivation);
    static CMPIStatus driveDeActivateFilter(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                            const CMPISelectExp *filter, const char *className,
                                            const CMPIObjectPath *op, CMPIBoolean lastActivation);
    static CMPIStatus driveEnableIndications(CMPIIndicationMI *mi, const CMPIContext *ctx);
    static CMPIStatus driveDisableIndications(CMPIIndicationMI *mi, const CMPIContext *ctx);
};

// An indication provider that delivers to the broker and leaves to it who
// receives what: every filter is accepted and none is recorded, and enabling
// or disabling indications changes nothing unless a provider says otherwise.
#pragma once

#include "CmpiIndicationMI.h"

namespace platform {

class AcceptingIndicationMI : public CmpiIndicationMI {
public:
    AcceptingIndicationMI(const CmpiBroker &mb, const CmpiContext &ctx);

    CmpiStatus authorizeFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                               const char *className, const CmpiObjectPath &op,
                               const char *owner) override;
    CmpiStatus mustPoll(const CmpiContext &ctx, const CmpiSelectExp &filter, const char *className,
                        const CmpiObjectPath &op) override;
    CmpiStatus activateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                              const char *className, const CmpiObjectPath &op,
                              bool firstActivation) override;
    CmpiStatus deActivateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                const char *className, const CmpiObjectPath &op,
                                bool lastActivation) override;
    CmpiStatus enableIndications(const CmpiContext &ctx) override;
    CmpiStatus disableIndications(const CmpiContext &ctx) override;
};

}  // namespace platform

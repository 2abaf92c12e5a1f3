// The watched hardware classes (sensors, memory, processors, power supplies,
// controllers, storage): for the class a request names, the elements the host
// profile scripts for it, each on its scripted path with the HealthState of
// the poll. It serves whatever class a registration gives it.
#pragma once

#include "CmpiInstanceMI.h"

namespace HostProviders {

class WatchedElementProvider : public CmpiInstanceMI {
public:
    WatchedElementProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}
    ~WatchedElementProvider() override = default;

    // The class's next poll.
    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override;
    // These two count no poll: they answer as the last enumeration did.
    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop) override;
    // A path no element has is CMPI_RC_ERR_NOT_FOUND: sfcb's provider
    // process dies of an up-call answered OK without an instance.
    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override;
};

}  // namespace HostProviders

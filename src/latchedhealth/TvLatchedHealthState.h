// The provider of Talvex_LatchedHealthState and Talvex_RollupHealthState,
// and the indication provider of Talvex_KernelIPChangedIndication. Its two
// factories create one object each; neither holds state of its own, so both
// work on the process-wide records, threads and change detector.
#pragma once

#include "CmpiInstanceMI.h"
#include "platform/AcceptingIndicationMI.h"

namespace TvLatchedHealth {

class TvLatchedHealthState : public CmpiInstanceMI, private platform::AcceptingIndicationMI {
public:
    TvLatchedHealthState(const CmpiBroker &mb, const CmpiContext &ctx);
    ~TvLatchedHealthState() override;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override;
    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override;
    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override;

    // Starts the health and kernel IP threads unless they were started
    // before; a thread that cannot be created aborts the process.
    CmpiStatus initialize(const CmpiContext &ctx) override;
    // Refused with CMPI_RC_NEVER_UNLOAD unless terminating; terminating, it
    // stops both threads for the rest of the process.
    CmpiStatus cleanup(const CmpiContext &ctx, bool terminating) override;
    int isUnloadable() const override;

    // Switch the kernel IP change detector.
    CmpiStatus enableIndications(const CmpiContext &ctx) override;
    CmpiStatus disableIndications(const CmpiContext &ctx) override;
};

}  // namespace TvLatchedHealth

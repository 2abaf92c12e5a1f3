// The provider of Talvex_LatchedHealthState and Talvex_RollupHealthState,
// and the indication provider of Talvex_KernelIPChangedIndication. Its two
// factories create one object each; neither holds state of its own, so both
// work on the process-wide records, threads and change detector.
#pragma once

#include "CmpiIndicationMI.h"
#include "CmpiInstanceMI.h"

namespace TvLatchedHealth {

class TvLatchedHealthState : public CmpiInstanceMI, private CmpiIndicationMI {
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

    // Filters are not recorded: the detector delivers to the broker, which
    // decides who receives what.
    CmpiStatus mustPoll(const CmpiContext &ctx, const CmpiSelectExp &filter, const char *className,
                        const CmpiObjectPath &op) override;
    CmpiStatus authorizeFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                               const char *className, const CmpiObjectPath &op,
                               const char *owner) override;
    CmpiStatus activateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                              const char *className, const CmpiObjectPath &op,
                              bool firstActivation) override;
    CmpiStatus deActivateFilter(const CmpiContext &ctx, const CmpiSelectExp &filter,
                                const char *className, const CmpiObjectPath &op,
                                bool lastActivation) override;
    // Switch the kernel IP change detector.
    CmpiStatus enableIndications(const CmpiContext &ctx) override;
    CmpiStatus disableIndications(const CmpiContext &ctx) override;
};

}  // namespace TvLatchedHealth

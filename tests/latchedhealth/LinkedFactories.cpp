// The latched-health factories as the shipped library defines them, built
// into the test program, with providers that start no threads: the tests
// run every poll themselves.
#include "CmpiProviderFactory.h"
#include "latchedhealth/TvLatchedHealthAssociation.h"
#include "latchedhealth/TvLatchedHealthState.h"

namespace {

class UnthreadedLatchedHealthState : public TvLatchedHealth::TvLatchedHealthState {
public:
    UnthreadedLatchedHealthState(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), TvLatchedHealthState(mb, ctx) {}
    CmpiStatus initialize(const CmpiContext &) override { return CmpiStatus(CMPI_RC_OK); }
};

}  // namespace

CMProviderBase(Talvex_LatchedHealthState);
CMProviderBase(Talvex_LatchedHealthAssociation);

CMInstanceMIFactory(UnthreadedLatchedHealthState, Talvex_LatchedHealthState)
CMAssociationMIFactory(TvLatchedHealth::TvLatchedHealthAssociation, Talvex_LatchedHealthAssociation)

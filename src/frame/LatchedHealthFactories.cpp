// The latched-health factories. The instance and the indication factory
// have base objects of their own, so each creates its own provider object;
// the two share everything through the subsystem's process-wide state.
#include "CmpiProviderFactory.h"
#include "latchedhealth/TvLatchedHealthAssociation.h"
#include "latchedhealth/TvLatchedHealthState.h"

CMProviderBase(Talvex_LatchedHealthState);
CMProviderBase(Talvex_LatchedHealthAssociation);
CMProviderBase(Talvex_KernelIPChangedIndication);

CMInstanceMIFactory(TvLatchedHealth::TvLatchedHealthState, Talvex_LatchedHealthState)
CMAssociationMIFactory(TvLatchedHealth::TvLatchedHealthAssociation, Talvex_LatchedHealthAssociation)
CMIndicationMIFactory(TvLatchedHealth::TvLatchedHealthState, Talvex_KernelIPChangedIndication)

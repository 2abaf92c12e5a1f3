// The factories of every provider in the stand-in host library, one base
// object each. A provider added here also gets its factory into
// hostproviders.map and its classes into hostproviders.reg.
#include "CmpiProviderFactory.h"
#include "ComputerSystemProvider.h"
#include "WatchedElementProvider.h"

CMProviderBase(OMC_UnitaryComputerSystemProvider);
CMProviderBase(HostWatchedElementProvider);

CMInstanceMIFactory(HostProviders::ComputerSystemProvider, OMC_UnitaryComputerSystemProvider)
CMInstanceMIFactory(HostProviders::WatchedElementProvider, HostWatchedElementProvider)

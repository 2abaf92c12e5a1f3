// The Ethernet port provider's two interfaces share one provider object.
#include "CmpiProviderFactory.h"
#include "ethernet/EthernetPortProvider.h"

CMProviderBase(EthernetPortProvider);

CMInstanceMIFactory(EthernetProvider::EthernetPortProvider, EthernetPortProvider)
CMAssociationMIFactory(EthernetProvider::EthernetPortProvider, EthernetPortProvider)

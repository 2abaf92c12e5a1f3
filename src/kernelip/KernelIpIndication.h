// The kernel IP change detector: while the broker has indications enabled,
// each cycle re-reads the interface addresses and, for every address of an
// interface that replaced another of the same family, delivers a
// Talvex_KernelIPChangedIndication carrying the endpoints of both.
#pragma once

#include <boost/shared_ptr.hpp>
#include <map>
#include <string>
#include <vector>

#include "CmpiBroker.h"
#include "kernelip/IAddress.h"
#include "kernelip/InterfaceAddressSource.h"
#include "platform/OmcMutex.h"

namespace TVX {

// Interface name to its addresses, in name order; the addresses of one
// interface keep the order of the interface-address list.
using InterfaceAddressMap = std::multimap<std::string, boost::shared_ptr<IAddress>>;

class KernelIpIndication {
public:
    explicit KernelIpIndication(InterfaceAddressSource &source = systemInterfaceAddresses());

    // Switches detection on and reads the current addresses; the first time,
    // also the baseline.
    void enableIndication();
    // Switches detection off; what was read stays for the next enable.
    void disableIndication();
    bool isEnabled();
    void poll();

    // One detection cycle, from a thread attached to the broker with `ctx`.
    // Nothing happens while disabled. Exceptions leave it with the lock
    // released and the baseline unchanged.
    void testAndSend(const CmpiContext &ctx, CmpiBroker *broker);

private:
    using AddressPtr = boost::shared_ptr<IAddress>;

    AddressPtr getAddressPtr(const ifaddrs *entry);
    void buildMap(InterfaceAddressMap &addresses);
    bool isChanged(const std::string &interfaceName, const AddressPtr &current,
                   std::vector<AddressPtr> &replaced);
    void send(const CmpiContext &ctx, CmpiBroker *broker, const std::string &interfaceName,
              const AddressPtr &previous, const AddressPtr &current);
    void formatIndication(const CmpiContext &ctx, CmpiInstance &indication, CmpiBroker *broker,
                          const std::string &interfaceName, const AddressPtr &previous,
                          const AddressPtr &current);

    bool enabled;
    bool initialized;
    OMC::Mutex lock;
    InterfaceAddressMap currentAddresses;
    InterfaceAddressMap previousAddresses;
    InterfaceAddressSource &addressSource;
};

}  // namespace TVX

// One address of one kernel network interface, as the system's
// interface-address list reports it: its text, compared with other
// addresses, and the endpoint instance it stands for. Immutable; shared
// through boost::shared_ptr.
#pragma once

#include <ifaddrs.h>

#include <cstdint>
#include <string>

#include "CmpiBroker.h"
#include "CmpiInstance.h"

namespace TVX {

// The namespace of the endpoint instances and of the change indications:
// they are built on the monitor thread, outside any request.
inline constexpr const char *kKernelIpNamespace = "root/cimv2";

class IAddress {
public:
    virtual CmpiInstance buildInterfaceObject(const CmpiContext &ctx, CmpiBroker *broker,
                                              const std::string &interfaceName) const = 0;
    // False for null and for an address of the other family.
    virtual bool isEqual(const IAddress *other) const = 0;
    virtual std::string getAddress() const = 0;
    virtual ~IAddress() = default;
    virtual std::string getCreationClassName() const = 0;

    const std::int32_t family;  // AF_INET or AF_INET6, from the entry's sa_family

protected:
    // An entry without an address or a netmask is refused with
    // std::invalid_argument, as an unsupported family is: the detector then
    // skips it like any entry it cannot use.
    explicit IAddress(const ifaddrs *entry);

    // A new endpoint instance in "root/cimv2" with the properties both
    // families share, in their order, ending with ProtocolIFType.
    CmpiInstance newEndpointInstance(const CmpiContext &ctx, CmpiBroker *broker,
                                     const std::string &interfaceName, std::int32_t protocolIFType) const;
};

}  // namespace TVX

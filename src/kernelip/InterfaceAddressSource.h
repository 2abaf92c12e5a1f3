// Where the change detector reads the system's interface-address list: the
// real getifaddrs and freeifaddrs, or a script of lists in tests.
#pragma once

#include <ifaddrs.h>

namespace TVX {

class InterfaceAddressSource {
public:
    virtual ~InterfaceAddressSource() = default;

    // As getifaddrs: 0 with the list in *list, or -1 with errno set.
    virtual int read(ifaddrs **list) = 0;
    // Frees a list that read gave.
    virtual void release(ifaddrs *list) = 0;
};

// getifaddrs and freeifaddrs themselves.
InterfaceAddressSource &systemInterfaceAddresses();

}  // namespace TVX

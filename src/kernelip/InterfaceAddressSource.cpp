#include "kernelip/InterfaceAddressSource.h"

namespace TVX {
namespace {

class SystemInterfaceAddresses : public InterfaceAddressSource {
public:
    int read(ifaddrs **list) override { return getifaddrs(list); }
    void release(ifaddrs *list) override { freeifaddrs(list); }
};

}  // namespace

InterfaceAddressSource &systemInterfaceAddresses() {
    static SystemInterfaceAddresses system;
    return system;
}

}  // namespace TVX

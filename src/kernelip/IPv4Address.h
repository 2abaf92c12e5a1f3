// An IPv4 address of an interface with its netmask, both as dotted-decimal
// text.
#pragma once

#include "kernelip/IAddress.h"

namespace TVX {

class IPv4Address : public IAddress {
public:
    // Throws std::invalid_argument "Address conversion failed" when the
    // address has no text form; a netmask without one is kept empty.
    explicit IPv4Address(const ifaddrs *entry);

    CmpiInstance buildInterfaceObject(const CmpiContext &ctx, CmpiBroker *broker,
                                      const std::string &interfaceName) const override;
    // Equal when both address and netmask are.
    bool isEqual(const IAddress *other) const override;
    std::string getAddress() const override;
    ~IPv4Address() override = default;
    std::string getCreationClassName() const override;

private:
    char address[16];
    char netmask[16];
};

}  // namespace TVX

// An IPv6 address of an interface as inet_ntop writes it, with the prefix
// length of its netmask.
#pragma once

#include "kernelip/IAddress.h"

namespace TVX {

class IPv6Address : public IAddress {
public:
    // Never throws for an address without a text form: it is kept empty.
    explicit IPv6Address(const ifaddrs *entry);

    CmpiInstance buildInterfaceObject(const CmpiContext &ctx, CmpiBroker *broker,
                                      const std::string &interfaceName) const override;
    // Equal when the address texts are; the prefix length plays no part.
    bool isEqual(const IAddress *other) const override;
    std::string getAddress() const override;
    ~IPv6Address() override = default;
    std::string getCreationClassName() const override;

    // The number of leading one bits of a mask of `length` bytes, or 0 when
    // a one bit follows a zero bit anywhere in it.
    static int getPrefix(const void *mask, int length);

private:
    char address[46];
    std::int32_t prefixLength;
};

}  // namespace TVX

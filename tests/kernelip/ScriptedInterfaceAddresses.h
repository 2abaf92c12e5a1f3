// Interface-address lists in getifaddrs's own shape, written as text, and a
// source that hands them to a change detector in place of the system's.
#pragma once

#include <ifaddrs.h>
#include <sys/socket.h>

#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "kernelip/InterfaceAddressSource.h"

namespace kipdtest {

// Addresses and netmasks are texts inet_pton reads for AF_INET and
// AF_INET6; an empty text leaves that pointer null. Any other family gets a
// bare socket address of that family (a link-layer entry, say).
struct Entry {
    std::string name;
    int family;
    std::string address;
    std::string netmask;
};

using EntryList = std::vector<Entry>;

inline Entry ipv4(const std::string &name, const std::string &address, const std::string &netmask = "255.255.255.0") {
    return {name, AF_INET, address, netmask};
}
inline Entry ipv6(const std::string &name, const std::string &address,
                  const std::string &netmask = "ffff:ffff:ffff:ffff::") {
    return {name, AF_INET6, address, netmask};
}

// A built list, owning its linked nodes, socket addresses and names.
class InterfaceAddressList {
public:
    explicit InterfaceAddressList(const EntryList &entries);
    InterfaceAddressList(const InterfaceAddressList &) = delete;
    InterfaceAddressList &operator=(const InterfaceAddressList &) = delete;

    ifaddrs *head() { return nodes.empty() ? nullptr : &nodes.front(); }

private:
    sockaddr *socketAddress(int family, const std::string &text);

    std::vector<ifaddrs> nodes;
    std::deque<sockaddr_storage> socketAddresses;
    std::deque<std::string> names;
};

class ScriptedInterfaceAddresses : public TVX::InterfaceAddressSource {
public:
    // From now on reads give these lists in turn, round and round.
    void show(const std::vector<EntryList> &lists);
    void show(const EntryList &list) { show(std::vector<EntryList>{list}); }
    // `count` reads fail with `error`, once `after` more reads have succeeded.
    void failReads(int error, int count, int after = 0);

    int read(ifaddrs **list) override;
    void release(ifaddrs *) override { --handedOut; }

    int readCount() const { return reads; }
    // Lists handed out and not yet released.
    int unreleased() const { return handedOut; }

private:
    std::vector<std::unique_ptr<InterfaceAddressList>> lists;
    std::size_t nextList = 0;
    int readsBeforeFailing = 0;
    int failuresLeft = 0;
    int failureError = 0;
    int reads = 0;
    int handedOut = 0;
};

}  // namespace kipdtest

// Interface-address lists in getifaddrs's own shape, written as text, and a
// source that hands them to a change detector in place of the system's.
#pragma once

#include <ifaddrs.h>
#include <sys/socket.h>

#include <deque>
#include <string>
#include <vector>

#include "kernelip/InterfaceAddressSource.h"

namespace kipdtest {

// Texts inet_pton reads for AF_INET and AF_INET6; an empty text leaves that
// pointer null. Any other family gets a bare socket address of that family.
struct Entry {
    std::string name;
    int family;
    std::string address, netmask;
};
using EntryList = std::vector<Entry>;

inline Entry ipv4(const std::string &name, const std::string &address, const std::string &netmask = "255.255.255.0") {
    return {name, AF_INET, address, netmask};
}
inline Entry ipv6(const std::string &name, const std::string &address,
                  const std::string &netmask = "ffff:ffff:ffff:ffff::") {
    return {name, AF_INET6, address, netmask};
}

class ScriptedInterfaceAddresses : public TVX::InterfaceAddressSource {
public:
    // From now on reads give these lists in turn, round and round.
    void show(const std::vector<EntryList> &lists);
    void show(const EntryList &list) { show(std::vector<EntryList>{list}); }
    // The read after the next `after` reads fails with `error`.
    void failOneRead(int error, int after) {
        failureError = error;
        readsBeforeFailure = after;
    }

    int read(ifaddrs **list) override;
    void release(ifaddrs *) override { --handedOut; }

    // Lists handed out and not yet released.
    int unreleased() const { return handedOut; }

private:
    sockaddr *socketAddress(int family, const std::string &text);

    // Linked nodes point into these, so nothing here moves once built.
    std::deque<std::vector<ifaddrs>> lists;
    std::deque<sockaddr_storage> socketAddresses;
    std::deque<std::string> names;
    std::size_t nextList = 0;
    int readsBeforeFailure = -1, failureError = 0, handedOut = 0;
};

}  // namespace kipdtest

// Interface-address lists in getifaddrs's own shape, written as text, and a
// source that hands them to a change detector in place of the system's,
// counting what it reads and frees.
#pragma once

#include <ifaddrs.h>
#include <sys/socket.h>

#include <cstddef>
#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "kernelip/InterfaceAddressSource.h"

namespace kipdtest {

// One entry. AF_INET and AF_INET6 addresses and netmasks are texts that
// inet_pton reads; an empty text leaves that pointer null. Any other family
// gets a bare socket address of that family (a link-layer entry, say).
struct Entry {
    std::string name;
    int family;
    std::string address;
    std::string netmask;
};

using EntryList = std::vector<Entry>;

Entry ipv4(const std::string &name, const std::string &address, const std::string &netmask = "255.255.255.0");
Entry ipv6(const std::string &name, const std::string &address, const std::string &netmask = "ffff:ffff:ffff:ffff::");

// A built list: linked nodes, their socket addresses and names, owned here.
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
    // `count` reads fail with `error` and give no list, once `after` more
    // reads have succeeded.
    void failReads(int error, int count, int after = 0);

    int read(ifaddrs **list) override;
    void release(ifaddrs *list) override;

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

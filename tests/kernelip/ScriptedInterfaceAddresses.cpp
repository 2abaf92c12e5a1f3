#include "ScriptedInterfaceAddresses.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <cerrno>
#include <stdexcept>

namespace kipdtest {

InterfaceAddressList::InterfaceAddressList(const EntryList &entries) {
    // The nodes link to each other, so they never move once built.
    nodes.reserve(entries.size());
    for (const Entry &entry : entries) {
        ifaddrs &node = nodes.emplace_back();
        node.ifa_name = names.emplace_back(entry.name).data();
        node.ifa_addr = socketAddress(entry.family, entry.address);
        node.ifa_netmask = socketAddress(entry.family, entry.netmask);
        if (nodes.size() > 1) nodes[nodes.size() - 2].ifa_next = &node;
    }
}

sockaddr *InterfaceAddressList::socketAddress(int family, const std::string &text) {
    if (text.empty()) return nullptr;
    sockaddr_storage &storage = socketAddresses.emplace_back();
    storage.ss_family = static_cast<sa_family_t>(family);
    void *bytes = nullptr;
    if (family == AF_INET) bytes = &reinterpret_cast<sockaddr_in &>(storage).sin_addr;
    if (family == AF_INET6) bytes = &reinterpret_cast<sockaddr_in6 &>(storage).sin6_addr;
    if (bytes != nullptr && inet_pton(family, text.c_str(), bytes) != 1) {
        throw std::invalid_argument("not an address of its family: " + text);
    }
    return reinterpret_cast<sockaddr *>(&storage);
}

void ScriptedInterfaceAddresses::show(const std::vector<EntryList> &texts) {
    lists.clear();
    for (const EntryList &list : texts) lists.push_back(std::make_unique<InterfaceAddressList>(list));
    nextList = 0;
}

void ScriptedInterfaceAddresses::failReads(int error, int count, int after) {
    failureError = error;
    failuresLeft = count;
    readsBeforeFailing = after;
}

int ScriptedInterfaceAddresses::read(ifaddrs **list) {
    ++reads;
    if (readsBeforeFailing > 0) {
        --readsBeforeFailing;
    } else if (failuresLeft > 0) {
        --failuresLeft;
        errno = failureError;
        return -1;
    }
    *list = lists.empty() ? nullptr : lists[nextList++ % lists.size()]->head();
    // An empty list is a null one, which needs no release.
    if (*list != nullptr) ++handedOut;
    return 0;
}

}  // namespace kipdtest

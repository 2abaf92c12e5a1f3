#include "ScriptedInterfaceAddresses.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <cerrno>
#include <stdexcept>

namespace kipdtest {

sockaddr *ScriptedInterfaceAddresses::socketAddress(int family, const std::string &text) {
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
    socketAddresses.clear();
    names.clear();
    nextList = 0;
    for (const EntryList &text : texts) {
        std::vector<ifaddrs> &nodes = lists.emplace_back(text.size());
        for (std::size_t i = 0; i < text.size(); ++i) {
            nodes[i].ifa_name = names.emplace_back(text[i].name).data();
            nodes[i].ifa_addr = socketAddress(text[i].family, text[i].address);
            nodes[i].ifa_netmask = socketAddress(text[i].family, text[i].netmask);
            nodes[i].ifa_next = i + 1 < text.size() ? &nodes[i + 1] : nullptr;
        }
    }
}

int ScriptedInterfaceAddresses::read(ifaddrs **list) {
    if (readsBeforeFailure >= 0 && readsBeforeFailure-- == 0) {
        errno = failureError;
        return -1;
    }
    std::vector<ifaddrs> *nodes = lists.empty() ? nullptr : &lists[nextList++ % lists.size()];
    *list = nodes == nullptr || nodes->empty() ? nullptr : nodes->data();
    // An empty list is a null one, which needs no release.
    if (*list != nullptr) ++handedOut;
    return 0;
}

}  // namespace kipdtest

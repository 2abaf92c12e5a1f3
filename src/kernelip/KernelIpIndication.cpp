#include "kernelip/KernelIpIndication.h"

#include <netinet/in.h>
#include <syslog.h>

#include <algorithm>
#include <boost/make_shared.hpp>
#include <cerrno>
#include <ctime>
#include <exception>
#include <memory>
#include <sstream>
#include <stdexcept>
#include <system_error>

#include "CmpiDateTime.h"
#include "CmpiStatus.h"
#include "kernelip/IPv4Address.h"
#include "kernelip/IPv6Address.h"
#include "platform/OmcComputerSystem.h"

namespace TVX {
namespace {

constexpr const char *kIndicationClass = "Talvex_KernelIPChangedIndication";
constexpr CMPIUint16 perceivedSeverityDegraded = 3;

// Gives a list back to the source it came from, however the walk ends.
struct ReleaseTo {
    InterfaceAddressSource *source;
    void operator()(ifaddrs *list) const { source->release(list); }
};

}  // namespace

KernelIpIndication::KernelIpIndication(InterfaceAddressSource &source)
    : enabled(false), initialized(false), addressSource(source) {}

void KernelIpIndication::enableIndication() {
    {
        const OMC::MutexLock held(lock);
        enabled = true;
    }
    poll();
}

void KernelIpIndication::disableIndication() {
    const OMC::MutexLock held(lock);
    enabled = false;
}

bool KernelIpIndication::isEnabled() {
    const OMC::MutexLock held(lock);
    return enabled;
}

void KernelIpIndication::poll() {
    const OMC::MutexLock held(lock);
    buildMap(currentAddresses);
    if (!initialized) {
        buildMap(previousAddresses);
        initialized = true;
    }
}

void KernelIpIndication::testAndSend(const CmpiContext &ctx, CmpiBroker *broker) {
    if (!isEnabled()) return;
    poll();
    const OMC::MutexLock held(lock);
    for (const auto &[interfaceName, current] : currentAddresses) {
        std::vector<AddressPtr> replaced;
        if (!isChanged(interfaceName, current, replaced)) continue;
        for (const AddressPtr &previous : replaced) send(ctx, broker, interfaceName, previous, current);
    }
    // A fresh read, not a copy of the current state, is the next baseline.
    buildMap(previousAddresses);
}

KernelIpIndication::AddressPtr KernelIpIndication::getAddressPtr(const ifaddrs *entry) {
    try {
        // An entry without an address has no family, and is skipped as one
        // of an unsupported family is.
        const int family = entry->ifa_addr != nullptr ? entry->ifa_addr->sa_family : AF_UNSPEC;
        if (family == AF_INET) return boost::make_shared<IPv4Address>(entry);
        if (family == AF_INET6) return boost::make_shared<IPv6Address>(entry);
        throw std::invalid_argument("Unsupported protocol family: " + std::to_string(family));
    } catch (const std::invalid_argument &) {
        throw;
    } catch (const std::exception &error) {
        syslog(LOG_ERR, "Caught exception: %s\n", error.what());
        throw std::exception();
    }
}

void KernelIpIndication::buildMap(InterfaceAddressMap &addresses) {
    ifaddrs *list = nullptr;
    if (addressSource.read(&list) != 0) {
        const std::string reason = std::generic_category().message(errno);
        syslog(LOG_ERR, "Unable to refresh network interface information of the system, Error: %s\n",
               reason.c_str());
        return;
    }
    const std::unique_ptr<ifaddrs, ReleaseTo> held(list, ReleaseTo{&addressSource});
    // Filled aside, so that a walk cut short leaves the map as it was.
    InterfaceAddressMap fresh;
    for (const ifaddrs *entry = list; entry != nullptr; entry = entry->ifa_next) {
        if (entry->ifa_name == nullptr) continue;
        try {
            // At the end of the entries of the same name, which keeps list order.
            fresh.emplace_hint(fresh.end(), entry->ifa_name, getAddressPtr(entry));
        } catch (const std::invalid_argument &) {
            // Not an address the detector follows.
        }
    }
    addresses.swap(fresh);
}

bool KernelIpIndication::isChanged(const std::string &interfaceName, const AddressPtr &current,
                                   std::vector<AddressPtr> &replaced) {
    const auto previous = previousAddresses.equal_range(interfaceName);
    if (previous.first == previous.second) return false;
    replaced.clear();
    const auto present = currentAddresses.equal_range(interfaceName);
    for (auto before = previous.first; before != previous.second; ++before) {
        const IAddress *old = before->second.get();
        if (current->isEqual(old)) return false;
        if (old->family != current->family) continue;
        const bool stillPresent = std::any_of(present.first, present.second, [old](const auto &now) {
            return old->isEqual(now.second.get());
        });
        if (!stillPresent) replaced.push_back(before->second);
    }
    return !replaced.empty();
}

void KernelIpIndication::send(const CmpiContext &ctx, CmpiBroker *broker, const std::string &interfaceName,
                              const AddressPtr &previous, const AddressPtr &current) {
    CmpiInstance indication(CmpiObjectPath(kKernelIpNamespace, kIndicationClass));
    formatIndication(ctx, indication, broker, interfaceName, previous, current);
    try {
        broker->deliverIndication(ctx, kKernelIpNamespace, indication);
    } catch (const CmpiStatus &status) {
        syslog(LOG_ERR, "Failed to deliver indication %d\n", static_cast<int>(status.rc()));
    }
}

void KernelIpIndication::formatIndication(const CmpiContext &ctx, CmpiInstance &indication,
                                          CmpiBroker *broker, const std::string &interfaceName,
                                          const AddressPtr &previous, const AddressPtr &current) {
    std::ostringstream text;
    text << "Talvex:" << interfaceName;
    indication.setProperty("IndicationIdentifier", CmpiData(text.str()));
    const CMPIUint64 now = static_cast<CMPIUint64>(std::time(nullptr)) * 1000000u;
    indication.setProperty("IndicationTime", CmpiData(CmpiDateTime(now, false)));
    indication.setProperty("PerceivedSeverity", CmpiData(perceivedSeverityDegraded));
    indication.setProperty("SourceInstance", CmpiData(current->buildInterfaceObject(ctx, broker, interfaceName)));
    indication.setProperty("PreviousInstance", CmpiData(previous->buildInterfaceObject(ctx, broker, interfaceName)));
    // The source endpoint's path as a client writes it; the texts need no escaping.
    const std::string className = current->getCreationClassName();
    text.str("");
    text << kKernelIpNamespace << ':' << className << ".SystemCreationClassName=\""
         << OMC::getComputerSystemClassName() << "\",SystemName=\"" << OMC::getComputerSystemName(ctx, broker)
         << "\",CreationClassName=\"" << className << "\",Name=\"" << interfaceName << '"';
    indication.setProperty("SourceInstanceModelPath", CmpiData(text.str()));
    indication.setProperty("SourceInstanceHost", CmpiData(current->getAddress()));
}

}  // namespace TVX

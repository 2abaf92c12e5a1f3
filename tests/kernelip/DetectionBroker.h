// An embedded broker that knows the product's classes, standing where the
// host's broker stands for a kernel IP change detector. The thread that
// makes it is attached to it for its lifetime, as the monitor thread
// attaches itself. It keeps what is delivered (on the delivering thread,
// which is the one taking), and refuses deliveries on request.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "CmpiBroker.h"
#include "core/Broker.h"
#include "model/ValueText.h"

namespace kipdtest {

inline constexpr const char *kNs = "root/cimv2";

// A property's value as a client reads it.
inline std::string valueOf(const tvxbroker::Instance &instance, const std::string &name) {
    const tvxbroker::CimValue *value = instance.property(name);
    if (value == nullptr || value->null) return "<absent>";
    std::string text;
    bool quoted = false;
    tvxbroker::scalarText(*value, text, quoted);
    return text;
}

class DetectionBroker {
public:
    DetectionBroker()
        : embedded(productClasses()),
          cmpi(embedded.cmpiBroker()),
          attached(cmpi.prepareAttachThread(CmpiContext(embedded.newContext(kNs)))) {
        cmpi.attachThread(attached);
        embedded.subscribe([this](const std::string &nameSpace, const tvxbroker::Instance &event) {
            if (nameSpace == kNs) delivered.push_back(event);
            return refusals-- <= 0;
        });
    }
    ~DetectionBroker() {
        cmpi.detachThread(attached);
        embedded.shutdown();
    }
    DetectionBroker(const DetectionBroker &) = delete;
    DetectionBroker &operator=(const DetectionBroker &) = delete;

    CmpiBroker *broker() { return &cmpi; }
    const CmpiContext &context() const { return attached; }
    // The next `count` deliveries are refused (and still recorded).
    void refuseNext(int count) { refusals = count; }
    // What was delivered to the namespace since the previous take, in order.
    std::vector<tvxbroker::Instance> takeDelivered() { return std::exchange(delivered, {}); }
    // "Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0" or
    // "Talvex:eth0 fd00::1/64 -> fd00::2/64" per indication taken: its
    // identifier, then the previous and the source endpoint's address.
    std::vector<std::string> takeSummaries() {
        std::vector<std::string> lines;
        for (const tvxbroker::Instance &event : takeDelivered()) {
            lines.push_back(valueOf(event, "IndicationIdentifier") + " " +
                            endpointText(event.property("PreviousInstance")) + " -> " +
                            endpointText(event.property("SourceInstance")));
        }
        return lines;
    }

private:
    static tvxbroker::BrokerConfig productClasses() {
        tvxbroker::BrokerConfig config;
        for (const char *mof : {TVX_PRODUCT_MOFS}) config.schema.loadFile(mof);
        return config;
    }
    static std::string endpointText(const tvxbroker::CimValue *endpoint) {
        if (endpoint == nullptr || endpoint->instance == nullptr) return "<no instance>";
        const tvxbroker::Instance &instance = *endpoint->instance;
        if (instance.property("IPv4Address") != nullptr) {
            return valueOf(instance, "IPv4Address") + "/" + valueOf(instance, "SubnetMask");
        }
        return valueOf(instance, "IPv6Address") + "/" + valueOf(instance, "PrefixLength");
    }

    tvxbroker::Broker embedded;
    CmpiBroker cmpi;
    CmpiContext attached;
    std::vector<tvxbroker::Instance> delivered;
    int refusals = 0;
};

}  // namespace kipdtest

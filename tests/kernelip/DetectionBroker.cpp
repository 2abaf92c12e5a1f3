#include "DetectionBroker.h"

#include <utility>

namespace kipdtest {
namespace {

tvxbroker::BrokerConfig productClasses() {
    tvxbroker::BrokerConfig config;
    for (const char *mof : {TVX_PRODUCT_MOFS}) config.schema.loadFile(mof);
    return config;
}

std::string textOf(const tvxbroker::CimValue *value) { return value == nullptr ? "<absent>" : value->text; }

std::string endpointText(const tvxbroker::CimValue *endpoint) {
    if (endpoint == nullptr || endpoint->instance == nullptr) return "<no instance>";
    const tvxbroker::Instance &instance = *endpoint->instance;
    if (const tvxbroker::CimValue *v4 = instance.property("IPv4Address")) {
        return v4->text + "/" + textOf(instance.property("SubnetMask"));
    }
    const tvxbroker::CimValue *prefix = instance.property("PrefixLength");
    return textOf(instance.property("IPv6Address")) + "/" +
           (prefix != nullptr ? std::to_string(prefix->unsignedValue) : "<absent>");
}

}  // namespace

DetectionBroker::DetectionBroker()
    : embedded(productClasses()),
      cmpi(embedded.cmpiBroker()),
      attached(cmpi.prepareAttachThread(CmpiContext(embedded.newContext(kNs)))) {
    cmpi.attachThread(attached);
    embedded.subscribe([this](const std::string &nameSpace, const tvxbroker::Instance &event) {
        const std::lock_guard<std::mutex> held(mutex);
        if (nameSpace == kNs) delivered.push_back(event);
        return refusals-- <= 0;
    });
}

std::vector<tvxbroker::Instance> DetectionBroker::takeDelivered() {
    const std::lock_guard<std::mutex> held(mutex);
    return std::exchange(delivered, {});
}

std::vector<std::string> DetectionBroker::takeSummaries() {
    std::vector<std::string> lines;
    for (const tvxbroker::Instance &event : takeDelivered()) {
        lines.push_back(textOf(event.property("IndicationIdentifier")) + " " +
                        endpointText(event.property("PreviousInstance")) + " -> " +
                        endpointText(event.property("SourceInstance")));
    }
    return lines;
}

}  // namespace kipdtest

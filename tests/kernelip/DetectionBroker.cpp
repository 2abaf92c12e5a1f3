#include "DetectionBroker.h"

#include "core/EncObjects.h"
#include "model/CimTypes.h"
#include "model/ValueText.h"

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
    : embedded(productClasses()), cmpi(embedded.cmpiBroker()), requestContext(embedded.newContext(kNs)) {
    embedded.subscribe(sink.subscriber(true));
    embedded.subscribe([this](const std::string &, const tvxbroker::Instance &) {
        if (refusals.load() <= 0) return true;
        --refusals;
        return false;
    });
}

std::vector<brokertest::Delivery> DetectionBroker::takeDelivered() {
    std::vector<brokertest::Delivery> all = sink.received();
    std::vector<brokertest::Delivery> fresh(all.begin() + static_cast<std::ptrdiff_t>(taken), all.end());
    taken = all.size();
    return fresh;
}

const tvxbroker::Instance &brokerSide(const CmpiInstance &instance) {
    return tvxbroker::enc::instanceOf(instance.getEnc())->value;
}

std::vector<std::string> propertyLines(const tvxbroker::Instance &instance) {
    std::vector<std::string> lines;
    for (const tvxbroker::NamedValue &property : instance.properties) {
        const std::string type = property.value.type == CMPI_instance ? "instance"
                                                                      : tvxbroker::cimTypeName(property.value.type);
        std::string text = "NULL";
        bool quoted = false;
        if (!property.value.null) tvxbroker::scalarText(property.value, text, quoted);
        lines.push_back(property.name + " " + type + " " + text);
    }
    return lines;
}

std::vector<std::string> summaries(const std::vector<brokertest::Delivery> &deliveries) {
    std::vector<std::string> lines;
    for (const brokertest::Delivery &delivery : deliveries) {
        const tvxbroker::Instance &event = delivery.event;
        lines.push_back(textOf(event.property("IndicationIdentifier")) + " " +
                        endpointText(event.property("PreviousInstance")) + " -> " +
                        endpointText(event.property("SourceInstance")));
    }
    return lines;
}

}  // namespace kipdtest

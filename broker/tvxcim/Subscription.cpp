#include "tvxcim/Subscription.h"

#include "tvxcim/CommandLine.h"

namespace tvxcim {

ClassSubscription::ClassSubscription(tvxbroker::Broker &on, const std::string &className)
    : broker(on), indicationClass(className), query("SELECT * FROM " + className) {
    setup = broker.activateFilter(defaultNameSpace, indicationClass, query, true);
    if (setup.ok()) setup = broker.enableIndications(defaultNameSpace, indicationClass);
}

ClassSubscription::~ClassSubscription() {
    broker.disableIndications(defaultNameSpace, indicationClass);
    broker.deActivateFilter(defaultNameSpace, indicationClass, query, true);
}

}  // namespace tvxcim

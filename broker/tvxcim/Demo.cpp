#include "tvxcim/Demo.h"

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <set>

namespace tvxcim {

using tvxbroker::Broker;
using tvxbroker::Instance;
using tvxbroker::ObjectPath;
using tvxbroker::ProviderRegistration;
using tvxbroker::Response;

namespace {

ObjectPath classPath(const std::string &className) { return ObjectPath{"", defaultNameSpace, className, {}}; }

// Waits for the first indication of the class, with the subscription made
// the way sfcb makes it.
void showFirstIndication(Broker &broker, const std::string &indicationClass, double seconds,
                         ResultWriter &writer) {
    std::mutex mutex;
    std::condition_variable arrived;
    std::optional<Instance> first;
    const int subscription = broker.subscribe([&](const std::string &, const Instance &indication) {
        std::lock_guard<std::mutex> lock(mutex);
        if (!first && tvxbroker::equalsIgnoreCase(indication.path.className, indicationClass)) {
            first = indication;
            arrived.notify_all();
        }
        return true;
    });
    const std::string query = "SELECT * FROM " + indicationClass;
    Response response = broker.activateFilter(defaultNameSpace, indicationClass, query, true);
    if (response.ok()) response = broker.enableIndications(defaultNameSpace, indicationClass);
    if (response.ok()) {
        std::unique_lock<std::mutex> lock(mutex);
        arrived.wait_for(lock, std::chrono::duration<double>(seconds), [&] { return first.has_value(); });
    }
    // Once unsubscribed, nothing writes `first` any more.
    broker.unsubscribe(subscription);
    writer.firstIndication(indicationClass, response, first, seconds);
    broker.disableIndications(defaultNameSpace, indicationClass);
    broker.deActivateFilter(defaultNameSpace, indicationClass, query, true);
}

}  // namespace

void runDemo(Broker &broker, const CommandLine &line, ResultWriter &writer) {
    std::set<std::string> shown;
    std::vector<ObjectPath> firstOfEachClass;
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (!registration.instance || !shown.insert(registration.className).second) continue;
        const Response response = broker.enumInstances(classPath(registration.className), line.properties);
        writer.enumeration(registration.className, response);
        if (response.ok() && !response.instances.empty() &&
            !broker.schema().isAssociation(registration.className)) {
            firstOfEachClass.push_back(response.instances.front().path);
        }
    }
    for (const ObjectPath &path : firstOfEachClass) {
        const Response response = broker.associatorNames(path, "", "", "", "");
        if (response.ok() && !response.paths.empty()) writer.associatorNames(path, response.paths);
    }
    shown.clear();
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (registration.indication && shown.insert(registration.className).second) {
            showFirstIndication(broker, registration.className, line.seconds, writer);
        }
    }
}

}  // namespace tvxcim

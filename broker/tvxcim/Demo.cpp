#include "tvxcim/Demo.h"

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <set>

#include "tvxcim/Subscription.h"

namespace tvxcim {

using tvxbroker::Broker;
using tvxbroker::Instance;
using tvxbroker::InterfaceKind;
using tvxbroker::ObjectPath;
using tvxbroker::ProviderRegistration;
using tvxbroker::Response;

namespace {

constexpr double kFirstIndicationSeconds = 10;
constexpr std::chrono::seconds kThreadStartLimit{10};

ObjectPath classPath(const std::string &className) { return ObjectPath{"", defaultNameSpace, className, {}}; }

// Waits for the first indication of the class, with the subscription made
// the way sfcb makes it. The subscription is removed before anything is
// written, so that no request runs while output is held back.
void showFirstIndication(Broker &broker, const std::string &indicationClass, double seconds,
                         ResultWriter &writer) {
    std::mutex mutex;
    std::condition_variable arrived;
    std::optional<Instance> first;
    const IndicationReceiver receiver(broker, [&](const std::string &, const Instance &indication) {
        const std::lock_guard<std::mutex> lock(mutex);
        if (!first && tvxbroker::equalsIgnoreCase(indication.path.className, indicationClass)) {
            first = indication;
            arrived.notify_all();
        }
        return true;
    });
    Response setup;
    {
        const ClassSubscription subscription(broker, indicationClass);
        setup = subscription.response();
        std::unique_lock<std::mutex> lock(mutex);
        if (setup.ok()) {
            arrived.wait_for(lock, std::chrono::duration<double>(seconds), [&] { return first.has_value(); });
        }
    }
    const std::lock_guard<std::mutex> lock(mutex);
    writer.firstIndication(indicationClass, setup, first, seconds);
}

}  // namespace

// Providers write to standard error while a request runs (an instance
// factory announces itself, for one), so what the demo has written is handed
// on before each request: with both streams in one file, a provider's line
// then never lands inside one of the demo's.
void runDemo(Broker &broker, const CommandLine &line, ResultWriter &writer) {
    // Every instance provider is loaded first, and their threads have begun
    // their first cycle, as on a broker that has served for a while: a
    // provider whose thread holds its lock for a whole cycle then answers
    // after that cycle. Indication providers are loaded by their
    // subscriptions, so that the first indication is one the demo receives.
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (registration.instance) broker.managementInterface(registration.providerName, InterfaceKind::Instance);
    }
    broker.awaitFirstThreadReleases(kThreadStartLimit);
    std::set<std::string> shown;
    std::vector<ObjectPath> firstOfEachClass;
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (!registration.instance || !shown.insert(registration.className).second) continue;
        writer.flush();
        const Response response = broker.enumInstances(classPath(registration.className), line.properties);
        writer.enumeration(registration.className, response);
        if (response.ok() && !response.instances.empty() &&
            !broker.schema().isAssociation(registration.className)) {
            firstOfEachClass.push_back(response.instances.front().path);
        }
    }
    for (const ObjectPath &path : firstOfEachClass) {
        writer.flush();
        const Response response = broker.associatorNames(path, "", "", "", "");
        if (response.ok() && !response.paths.empty()) writer.associatorNames(path, response.paths);
    }
    shown.clear();
    for (const ProviderRegistration &registration : broker.registrations()) {
        // Indications of a changed instance come only when something changes
        // on the host (`tvxcim listen` shows them); the demo waits only for
        // those a host sends by itself.
        if (registration.indication && !broker.schema().isA(registration.className, "CIM_InstIndication") &&
            shown.insert(registration.className).second) {
            writer.flush();
            showFirstIndication(broker, registration.className, line.seconds.value_or(kFirstIndicationSeconds),
                                writer);
        }
    }
}

}  // namespace tvxcim

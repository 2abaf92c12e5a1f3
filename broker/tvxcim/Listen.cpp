#include "tvxcim/Listen.h"

#include <memory>
#include <mutex>
#include <set>
#include <stdexcept>
#include <vector>

#include "tvxcim/StatusText.h"
#include "tvxcim/StopSignals.h"
#include "tvxcim/Subscription.h"

namespace tvxcim {

using tvxbroker::Instance;
using tvxbroker::ProviderRegistration;

void runListen(tvxbroker::Broker &broker, const CommandLine &line, ResultWriter &writer) {
    const StopSignals signals;
    std::mutex writing;
    const IndicationReceiver receiver(broker, [&](const std::string &, const Instance &indication) {
        const std::lock_guard<std::mutex> lock(writing);
        writer.instance(indication);
        writer.flush();
        return true;
    });
    std::set<std::string> classes;
    std::vector<std::unique_ptr<ClassSubscription>> subscriptions;
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (!registration.indication || !classes.insert(registration.className).second) continue;
        subscriptions.push_back(std::make_unique<ClassSubscription>(broker, registration.className));
        const tvxbroker::Response &response = subscriptions.back()->response();
        if (!response.ok()) {
            throw std::runtime_error("cannot listen for " + registration.className + ": " +
                                     describeFailure(response));
        }
    }
    if (subscriptions.empty()) throw std::runtime_error("the registration serves no indication class");
    signals.wait(line.seconds);
}

}  // namespace tvxcim

// The product served by the program itself, beside the stand-in host
// providers' library, so that a test or benchmark reaches the product's
// provider threads through the same seams the thread tests use. Every
// provider is still reached through the embedded broker and the C ABI.
#pragma once

#include <chrono>

#include "core/Broker.h"

namespace stress {

tvxbroker::BrokerConfig linkedProductConfig(tvxbroker::ThreadRelease release);

// Loads every registered provider of every kind, as a broker that has
// served every operation has, so that each threaded one starts its threads.
void loadEveryProvider(tvxbroker::Broker &broker);

// Brings on cycles of the product's provider threads as a spurious wake-up
// would, instead of waiting their periods.
class ProviderThreadDriver {
public:
    explicit ProviderThreadDriver(const tvxbroker::Broker &served) : broker(served) {}

    // Wakes every waiting thread once, without waiting for its cycle.
    static void wakeAll();
    // One more whole cycle of every thread the broker has prepared a
    // context for; false if `limit` passed first.
    bool cycleEach(std::chrono::milliseconds limit) const;

private:
    const tvxbroker::Broker &broker;
};

}  // namespace stress

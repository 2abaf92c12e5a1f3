// Records the indications a broker delivers, so that a test can wait for
// them with a deadline; a subscriber can refuse each one it is given.
#pragma once

#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <mutex>
#include <string>
#include <vector>

#include "core/Broker.h"

namespace brokertest {

// Only reached when something is wrong; a healthy run waits a period or two.
inline constexpr std::chrono::milliseconds kPatience{30000};

struct Delivery {
    std::string nameSpace;
    tvxbroker::Instance event;
};

class EventSink {
public:
    tvxbroker::IndicationSubscriber subscriber(bool accept) {
        return [this, accept](const std::string &nameSpace, const tvxbroker::Instance &event) {
            {
                const std::lock_guard<std::mutex> lock(mutex);
                deliveries.push_back({nameSpace, event});
            }
            arrived.notify_all();
            return accept;
        };
    }

    // False when `patience` runs out before `count` events have arrived.
    bool waitFor(std::size_t count, std::chrono::milliseconds patience = kPatience) {
        std::unique_lock<std::mutex> lock(mutex);
        return arrived.wait_for(lock, patience, [&] { return deliveries.size() >= count; });
    }

    std::vector<Delivery> received() const {
        const std::lock_guard<std::mutex> lock(mutex);
        return deliveries;
    }

private:
    mutable std::mutex mutex;
    std::condition_variable arrived;
    std::vector<Delivery> deliveries;
};

}  // namespace brokertest

// How tvxcim receives indications: a receiver for whatever the broker
// delivers, and the indication providers of a class driven as sfcb drives
// them when a subscription to the class is made and when it is removed.
#pragma once

#include <string>
#include <utility>

#include "core/Broker.h"

namespace tvxcim {

// Gets every delivered indication while it exists.
class IndicationReceiver {
public:
    IndicationReceiver(tvxbroker::Broker &from, tvxbroker::IndicationSubscriber subscriber)
        : broker(from), subscription(from.subscribe(std::move(subscriber))) {}
    ~IndicationReceiver() { broker.unsubscribe(subscription); }
    IndicationReceiver(const IndicationReceiver &) = delete;
    IndicationReceiver &operator=(const IndicationReceiver &) = delete;

private:
    tvxbroker::Broker &broker;
    int subscription;
};

// The class's filter activated and its indications enabled while it exists.
class ClassSubscription {
public:
    ClassSubscription(tvxbroker::Broker &on, const std::string &className);
    ~ClassSubscription();
    ClassSubscription(const ClassSubscription &) = delete;
    ClassSubscription &operator=(const ClassSubscription &) = delete;

    // The providers' answer to setting it up.
    const tvxbroker::Response &response() const { return setup; }

private:
    tvxbroker::Broker &broker;
    std::string indicationClass;
    std::string query;
    tvxbroker::Response setup;
};

}  // namespace tvxcim

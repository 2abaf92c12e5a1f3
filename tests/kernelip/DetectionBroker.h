// An embedded broker that knows the product's classes, standing where the
// host's broker stands for a kernel IP change detector: threads attach to it
// as the monitor thread does, and it keeps what is delivered (refusing
// deliveries on request).
#pragma once

#include <atomic>
#include <string>
#include <vector>

#include "CmpiBroker.h"
#include "EventSink.h"
#include "core/Broker.h"

namespace kipdtest {

inline constexpr const char *kNs = "root/cimv2";

class DetectionBroker {
public:
    DetectionBroker();
    ~DetectionBroker() { embedded.shutdown(); }
    DetectionBroker(const DetectionBroker &) = delete;
    DetectionBroker &operator=(const DetectionBroker &) = delete;

    CmpiBroker *broker() { return &cmpi; }
    // A context prepared for a new thread, as a provider's initialize makes one.
    CmpiContext threadContext() const { return cmpi.prepareAttachThread(requestContext); }
    // The next `count` deliveries are refused (and still recorded).
    void refuseNext(int count) { refusals = count; }
    // What was delivered since the previous call, in order.
    std::vector<brokertest::Delivery> takeDelivered();

private:
    tvxbroker::Broker embedded;
    CmpiBroker cmpi;
    CmpiContext requestContext;
    brokertest::EventSink sink;
    std::size_t taken = 0;
    std::atomic<int> refusals{0};
};

// The calling thread attached to the broker for its lifetime, as the
// monitor thread attaches itself; detaching frees what was made for it.
class AttachedThread {
public:
    explicit AttachedThread(DetectionBroker &broker)
        : cmpi(*broker.broker()), context(broker.threadContext()) {
        cmpi.attachThread(context);
    }
    ~AttachedThread() { cmpi.detachThread(context); }
    AttachedThread(const AttachedThread &) = delete;
    AttachedThread &operator=(const AttachedThread &) = delete;

    const CmpiBroker &cmpi;
    const CmpiContext context;
};

// The instance as the broker holds it, which is what a client is given.
const tvxbroker::Instance &brokerSide(const CmpiInstance &instance);

// "Name type value" per property, in the order they were set; an embedded
// instance's value is its path.
std::vector<std::string> propertyLines(const tvxbroker::Instance &instance);

// "Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0" or
// "Talvex:eth0 fd00::1/64 -> fd00::2/64" per delivered indication: its
// identifier, then the previous and the source endpoint's address.
std::vector<std::string> summaries(const std::vector<brokertest::Delivery> &deliveries);

}  // namespace kipdtest

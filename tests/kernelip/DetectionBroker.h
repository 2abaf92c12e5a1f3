// An embedded broker that knows the product's classes, standing where the
// host's broker stands for a kernel IP change detector. The thread that
// makes it is attached to it for its lifetime, as the monitor thread
// attaches itself. It keeps what is delivered, and refuses deliveries on
// request.
#pragma once

#include <mutex>
#include <string>
#include <vector>

#include "CmpiBroker.h"
#include "core/Broker.h"

namespace kipdtest {

inline constexpr const char *kNs = "root/cimv2";

class DetectionBroker {
public:
    DetectionBroker();
    ~DetectionBroker() {
        cmpi.detachThread(attached);
        embedded.shutdown();
    }
    DetectionBroker(const DetectionBroker &) = delete;
    DetectionBroker &operator=(const DetectionBroker &) = delete;

    CmpiBroker *broker() { return &cmpi; }
    // The attached thread's context.
    const CmpiContext &context() const { return attached; }
    // The next `count` deliveries are refused (and still recorded).
    void refuseNext(int count) {
        const std::lock_guard<std::mutex> held(mutex);
        refusals = count;
    }
    // What was delivered to the namespace since the previous take, in order.
    std::vector<tvxbroker::Instance> takeDelivered();
    // "Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0" or
    // "Talvex:eth0 fd00::1/64 -> fd00::2/64" per indication taken: its
    // identifier, then the previous and the source endpoint's address.
    std::vector<std::string> takeSummaries();

private:
    tvxbroker::Broker embedded;
    CmpiBroker cmpi;
    CmpiContext attached;
    std::mutex mutex;
    std::vector<tvxbroker::Instance> delivered;
    int refusals = 0;
};

}  // namespace kipdtest

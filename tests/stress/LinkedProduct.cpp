#include "LinkedProduct.h"

#include <thread>

#include "heartbeat/HeartbeatIndication.h"
#include "heartbeat/HeartbeatState.h"
#include "latchedhealth/LatchedHealthState.h"

namespace stress {

using namespace tvxbroker;

namespace {

// The threads of one subsystem: they share its mutex, which each holds for
// a whole cycle, and its condition.
struct Subsystem {
    OMC::Mutex &mutex;
    OMC::Condition &condition;
    bool heartbeat;
};

const Subsystem kSubsystems[] = {
    {Heartbeat::heartbeatMutex, Heartbeat::heartbeatCondition, true},
    {TvLatchedHealth::healthMutex, TvLatchedHealth::healthCondition, false},
};

std::vector<std::uint64_t> releasesOf(const Broker &broker, const Subsystem &subsystem) {
    std::vector<std::uint64_t> releases;
    for (const ThreadCycles &thread : broker.threadCycles()) {
        // The heartbeat's provider is named after its class.
        if ((thread.provider == Heartbeat::kHeartbeatClass) == subsystem.heartbeat) releases.push_back(thread.releases);
    }
    return releases;
}

// A thread that has released since the wake-up and is no longer holding
// the mutex has ended a whole cycle.
bool cycleOnce(const Broker &broker, const Subsystem &subsystem, std::chrono::steady_clock::time_point deadline) {
    std::vector<std::uint64_t> before;
    {
        const OMC::MutexLock lock(subsystem.mutex);
        before = releasesOf(broker, subsystem);
        subsystem.condition.broadcast();
    }
    for (;;) {
        {
            const OMC::MutexLock lock(subsystem.mutex);
            const std::vector<std::uint64_t> now = releasesOf(broker, subsystem);
            bool all = now.size() == before.size();
            for (std::size_t i = 0; all && i < now.size(); ++i) all = now[i] > before[i];
            if (all) return true;
        }
        if (std::chrono::steady_clock::now() > deadline) return false;
        std::this_thread::yield();
    }
}

}  // namespace

BrokerConfig linkedProductConfig(ThreadRelease release) {
    BrokerConfig config = loadBrokerConfig({TVX_HOST_PROVIDER_DIR}, {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                           {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF});
    // The program links every factory of the library.
    config.inProcessLocations = {"tvxprovider"};
    config.threadRelease = release;
    return config;
}

void loadEveryProvider(Broker &broker) {
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (registration.instance) broker.managementInterface(registration.providerName, InterfaceKind::Instance);
        if (registration.association) {
            broker.managementInterface(registration.providerName, InterfaceKind::Association);
        }
        if (registration.indication) broker.managementInterface(registration.providerName, InterfaceKind::Indication);
    }
}

void ProviderThreadDriver::wakeAll() {
    for (const Subsystem &subsystem : kSubsystems) {
        const OMC::MutexLock lock(subsystem.mutex);
        subsystem.condition.broadcast();
    }
}

bool ProviderThreadDriver::cycleEach(std::chrono::milliseconds limit) const {
    const auto deadline = std::chrono::steady_clock::now() + limit;
    for (const Subsystem &subsystem : kSubsystems) {
        if (!cycleOnce(broker, subsystem, deadline)) return false;
    }
    return true;
}

}  // namespace stress

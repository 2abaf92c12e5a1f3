#include "LatchedHealthBroker.h"

#include "latchedhealth/HealthMonitor.h"
#include "latchedhealth/LatchedHealthState.h"

namespace latchedtest {

namespace {

// Where the broker finds the factories of the test program itself.
constexpr const char *kLinkedIn = "linkedin";

bool linkedInProvider(const std::string &provider) {
    return provider == "Talvex_LatchedHealthState" || provider == "Talvex_LatchedHealthAssociation" ||
           provider == "Talvex_KernelIPChangedIndication";
}

}  // namespace

BrokerConfig LatchedHealthBroker::linkedInConfig() {
    BrokerConfig config = loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR},
                                           {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                           {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF, TVX_TEST_MOF});
    std::vector<ProviderRegistration> extra;
    for (ProviderRegistration &registration : config.registrations) {
        if (linkedInProvider(registration.providerName)) registration.location = kLinkedIn;
        ProviderRegistration added = registration;
        // A class of the test's MOF that the instance provider does not serve,
        // and a sensor class whose name does not fit a record.
        if (registration.className == "Talvex_LatchedHealthState") added.className = "Test_UnservedHealth";
        if (registration.className == "CIM_Sensor") added.className = kLongSensorClass;
        if (added.className != registration.className) extra.push_back(added);
    }
    config.registrations.insert(config.registrations.end(), extra.begin(), extra.end());
    config.inProcessLocations = {kLinkedIn};
    return config;
}

void LatchedHealthBroker::start(BrokerConfig config) {
    broker = std::make_unique<Broker>(std::move(config));
    const CmpiBroker mb(broker->cmpiBroker());
    threadContext = mb.prepareAttachThread(CmpiContext(broker->newContext(kNs)));
    mb.attachThread(threadContext);
}

void LatchedHealthBroker::stop() {
    CmpiBroker(broker->cmpiBroker()).detachThread(threadContext);
    broker->shutdown();
}

void LatchedHealthBroker::TearDown() {
    stop();
    EXPECT_EQ(HostSim_LiveListCount(), 0u);
    HostSim_ResetProfile();
}

void LatchedHealthBroker::serve(const std::string &profileJson) {
    char error[512];
    ASSERT_EQ(HostSim_LoadProfileText(profileJson.c_str(), error, sizeof error), 0) << error;
}

void LatchedHealthBroker::poll() {
    const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
    TvLatchedHealth::pollWatchedClasses(CmpiBroker(broker->cmpiBroker()), threadContext);
}

std::vector<TvLatchedHealth::HealthInfo> LatchedHealthBroker::recordsOf(const std::string &deviceId) {
    std::vector<TvLatchedHealth::HealthInfo> found;
    const OMC::MutexLock lock(TvLatchedHealth::healthMutex);
    for (const auto &record : TvLatchedHealth::healthList) {
        for (const TvLatchedHealth::HealthKey &key : record->keys) {
            if (key.keyName == "DeviceID" && key.keyValue == deviceId) found.push_back(*record);
        }
    }
    return found;
}

std::uint16_t LatchedHealthBroker::rollup() { return TvLatchedHealth::rollupHealthState.load(); }

}  // namespace latchedtest

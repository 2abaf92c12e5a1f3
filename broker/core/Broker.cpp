#include "core/Broker.h"

#include <algorithm>

#include "core/BrokerState.h"
#include "core/EncSupport.h"
#include "core/Requests.h"

namespace tvxbroker {

Broker::Broker(BrokerConfig config) : state(std::make_unique<State>(std::move(config))) {}

Broker::~Broker() { shutdown(); }

Response Broker::enumInstanceNames(const ObjectPath &classPath) {
    return requests::enumInstanceNames(*state, classPath);
}

Response Broker::enumInstances(const ObjectPath &classPath, const PropertyList &properties) {
    return requests::enumInstances(*state, classPath, properties);
}

// sfcb answers a client whose getInstance the provider answered with
// nothing as it would for an unknown instance.
Response Broker::getInstance(const ObjectPath &path, const PropertyList &properties) {
    Response response = requests::getInstance(*state, path, properties);
    if (response.ok() && response.instances.empty()) response.rc = CMPI_RC_ERR_NOT_FOUND;
    return response;
}

Response Broker::createInstance(const ObjectPath &path, const Instance &instance) {
    return requests::createInstance(*state, path, instance);
}

Response Broker::setInstance(const ObjectPath &path, const Instance &instance,
                             const PropertyList &properties) {
    return requests::setInstance(*state, path, instance, properties);
}

Response Broker::deleteInstance(const ObjectPath &path) {
    return requests::deleteInstance(*state, path);
}

Response Broker::execQuery(const ObjectPath &classPath, const std::string &query,
                           const std::string &language) {
    return requests::execQuery(*state, classPath, query, language);
}

Response Broker::associators(const ObjectPath &path, const std::string &assocClass,
                             const std::string &resultClass, const std::string &role,
                             const std::string &resultRole, const PropertyList &properties) {
    return requests::association(*state, requests::AssociationCall::Associators, path,
                                 {assocClass, resultClass, role, resultRole}, properties);
}

Response Broker::associatorNames(const ObjectPath &path, const std::string &assocClass,
                                 const std::string &resultClass, const std::string &role,
                                 const std::string &resultRole) {
    return requests::association(*state, requests::AssociationCall::AssociatorNames, path,
                                 {assocClass, resultClass, role, resultRole}, std::nullopt);
}

Response Broker::references(const ObjectPath &path, const std::string &resultClass,
                            const std::string &role, const PropertyList &properties) {
    return requests::association(*state, requests::AssociationCall::References, path,
                                 {"", resultClass, role, ""}, properties);
}

Response Broker::referenceNames(const ObjectPath &path, const std::string &resultClass,
                                const std::string &role) {
    return requests::association(*state, requests::AssociationCall::ReferenceNames, path,
                                 {"", resultClass, role, ""}, std::nullopt);
}

Response Broker::authorizeFilter(const std::string &nameSpace, const std::string &indicationClass,
                                 const std::string &query, const std::string &owner) {
    return requests::indication(*state, requests::IndicationCall::Authorize,
                                {nameSpace, indicationClass, query, owner, false});
}

Response Broker::mustPoll(const std::string &nameSpace, const std::string &indicationClass,
                          const std::string &query) {
    return requests::indication(*state, requests::IndicationCall::MustPoll,
                                {nameSpace, indicationClass, query, "", false});
}

Response Broker::activateFilter(const std::string &nameSpace, const std::string &indicationClass,
                                const std::string &query, bool firstActivation) {
    return requests::indication(*state, requests::IndicationCall::Activate,
                                {nameSpace, indicationClass, query, "", firstActivation});
}

Response Broker::deActivateFilter(const std::string &nameSpace,
                                  const std::string &indicationClass, const std::string &query,
                                  bool lastActivation) {
    return requests::indication(*state, requests::IndicationCall::Deactivate,
                                {nameSpace, indicationClass, query, "", lastActivation});
}

Response Broker::enableIndications(const std::string &nameSpace,
                                   const std::string &indicationClass) {
    return requests::indication(*state, requests::IndicationCall::Enable,
                                {nameSpace, indicationClass, "", "", false});
}

Response Broker::disableIndications(const std::string &nameSpace,
                                    const std::string &indicationClass) {
    return requests::indication(*state, requests::IndicationCall::Disable,
                                {nameSpace, indicationClass, "", "", false});
}

int Broker::subscribe(IndicationSubscriber subscriber) {
    std::lock_guard<std::mutex> lock(state->subscriberMutex);
    const int id = state->nextSubscription++;
    state->subscribers.emplace(id, std::move(subscriber));
    return id;
}

void Broker::unsubscribe(int subscription) {
    std::lock_guard<std::mutex> lock(state->subscriberMutex);
    state->subscribers.erase(subscription);
}

void *Broker::managementInterface(const std::string &providerName, InterfaceKind kind,
                                  std::string *error) {
    return state->obtain(providerName, kind, error);
}

void Broker::shutdown() { state->shutdown(); }

const CMPIBroker *Broker::cmpiBroker() const { return &state->cmpi; }

const CMPIContext *Broker::newContext(const std::string &nameSpace) {
    std::unique_ptr<EncContext> context =
        enc::makeContext(state->contextTable, requestContextEntries(nameSpace));
    const CMPIContext *handle = &context->cmpi;
    std::lock_guard<std::mutex> lock(state->threadMutex);
    state->spareContexts.push_back(std::move(context));
    return handle;
}

std::vector<std::string> Broker::threadedProviders() const {
    std::lock_guard<std::mutex> lock(state->threadMutex);
    return state->threadedProviders;
}

bool Broker::awaitFirstThreadReleases(std::chrono::milliseconds limit) const {
    const auto deadline = std::chrono::steady_clock::now() + limit;
    for (;;) {
        const std::vector<ThreadCycles> threads = threadCycles();
        if (std::all_of(threads.begin(), threads.end(), [](const ThreadCycles &thread) { return thread.releases > 0; })) {
            return true;
        }
        if (std::chrono::steady_clock::now() >= deadline) return false;
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
}

std::vector<ThreadCycles> Broker::threadCycles() const {
    std::vector<ThreadCycles> threads;
    std::lock_guard<std::mutex> lock(state->threadMutex);
    for (const auto &thread : state->threadContexts) threads.push_back({thread->provider, thread->pool.releaseCount()});
    return threads;
}

const ClassSchema &Broker::schema() const { return state->config.schema; }

const std::vector<ProviderRegistration> &Broker::registrations() const {
    return state->config.registrations;
}

std::size_t Broker::liveObjectCount() const { return ObjectPool::liveCount(); }

namespace {

// Each class is served by one registration, and declared by some MOF file.
void addRegistrations(BrokerConfig &config, const std::string &registrationFile) {
    const std::size_t earlier = config.registrations.size();
    for (ProviderRegistration &registration : readRegistrationFile(registrationFile)) {
        for (std::size_t i = 0; i < earlier; ++i) {
            if (equalsIgnoreCase(config.registrations[i].className, registration.className)) {
                throw std::runtime_error(registrationFile + ": class " + registration.className +
                                         " is registered by an earlier registration file too");
            }
        }
        if (config.schema.find(registration.className) == nullptr) {
            throw std::runtime_error(registrationFile + ": class " + registration.className +
                                     " is registered but declared in no MOF file");
        }
        config.registrations.push_back(std::move(registration));
    }
}

}  // namespace

BrokerConfig loadBrokerConfig(const std::vector<std::string> &providerDirs,
                              const std::vector<std::string> &registrationFiles,
                              const std::vector<std::string> &mofFiles) {
    BrokerConfig config;
    config.providerDirs = providerDirs;
    for (const std::string &mof : mofFiles) config.schema.loadFile(mof);
    for (const std::string &registrationFile : registrationFiles) addRegistrations(config, registrationFile);
    return config;
}

}  // namespace tvxbroker

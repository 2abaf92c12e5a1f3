// The embedded CMPI broker: it stands where sfcb stands on a host. It loads
// provider libraries named by an sfcb provider registration, calls their
// factories as sfcb does (one management interface per provider name and
// kind), dispatches requests to them through the CMPI C ABI, serves their
// up-calls, owns every object it creates for them and delivers their
// indications to in-process subscribers.
#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "cmpi/cmpift.h"
#include "model/CimValue.h"
#include "model/ClassSchema.h"
#include "model/ProviderRegistration.h"

namespace tvxbroker {

// What a request answered: its status and whatever the providers returned
// before it ended.
struct Response {
    CMPIrc rc = CMPI_RC_OK;
    std::optional<std::string> message;
    std::vector<Instance> instances;
    std::vector<ObjectPath> paths;
    std::vector<CimValue> values;
    bool done = false;  // some provider signalled the end of its results

    bool ok() const { return rc == CMPI_RC_OK; }
};

// A property list as CMPI passes it: absent means every property.
using PropertyList = std::optional<std::vector<std::string>>;

enum class InterfaceKind { Instance, Association, Indication };

// How an attached provider thread gives back the objects the broker created
// for it, which tells the two brokers a provider meets apart.
enum class ThreadRelease {
    // The host's broker: the context table's eighth entry,
    // releaseThreadObjects; no memory table.
    ContextEntry,
    // Stock sfcb 1.3: contexts with the seven published entries only, and
    // the memory table's mark and release.
    MarkRelease,
};

struct BrokerConfig {
    std::vector<std::string> providerDirs;  // searched for lib<location>.so
    std::vector<ProviderRegistration> registrations;
    ClassSchema schema;
    ThreadRelease threadRelease = ThreadRelease::ContextEntry;
    // Receives what the broker reports on its own: a provider that cannot be
    // loaded, a cleanup that failed. Unset, each goes to stderr as
    // "tvxbroker: <text>". Called from whichever thread hit the problem.
    std::function<void(const std::string &)> diagnostics;
    // Registration locations served by the running program itself instead of
    // a lib<location>.so: a test that links providers in and exports their
    // factories reaches them through the broker like any library.
    std::vector<std::string> inProcessLocations;
};

// One provider thread's progress: the provider that prepared its context
// while being loaded (empty for a context prepared otherwise) and how many
// times the thread has given back its thread objects, either way.
struct ThreadCycles {
    std::string provider;
    std::uint64_t releases = 0;
};

// Receives each delivered indication; returning false refuses it, and the
// delivering provider is told the delivery failed.
using IndicationSubscriber = std::function<bool(const std::string &nameSpace, const Instance &)>;

class Broker {
public:
    explicit Broker(BrokerConfig config);
    Broker(const Broker &) = delete;
    Broker &operator=(const Broker &) = delete;
    ~Broker();  // shuts down if that has not happened yet

    Response enumInstanceNames(const ObjectPath &classPath);
    Response enumInstances(const ObjectPath &classPath, const PropertyList &properties);
    Response getInstance(const ObjectPath &path, const PropertyList &properties);
    Response createInstance(const ObjectPath &path, const Instance &instance);
    Response setInstance(const ObjectPath &path, const Instance &instance,
                         const PropertyList &properties);
    Response deleteInstance(const ObjectPath &path);
    Response execQuery(const ObjectPath &classPath, const std::string &query,
                       const std::string &language);

    // Empty texts mean "no filter".
    Response associators(const ObjectPath &path, const std::string &assocClass,
                         const std::string &resultClass, const std::string &role,
                         const std::string &resultRole, const PropertyList &properties);
    Response associatorNames(const ObjectPath &path, const std::string &assocClass,
                             const std::string &resultClass, const std::string &role,
                             const std::string &resultRole);
    Response references(const ObjectPath &path, const std::string &resultClass,
                        const std::string &role, const PropertyList &properties);
    Response referenceNames(const ObjectPath &path, const std::string &resultClass,
                            const std::string &role);

    // Indication providers of the class (and its subclasses), as sfcb drives
    // them when a subscription is made and removed.
    Response authorizeFilter(const std::string &nameSpace, const std::string &indicationClass,
                             const std::string &query, const std::string &owner);
    Response mustPoll(const std::string &nameSpace, const std::string &indicationClass,
                      const std::string &query);
    Response activateFilter(const std::string &nameSpace, const std::string &indicationClass,
                            const std::string &query, bool firstActivation);
    Response deActivateFilter(const std::string &nameSpace, const std::string &indicationClass,
                              const std::string &query, bool lastActivation);
    Response enableIndications(const std::string &nameSpace, const std::string &indicationClass);
    Response disableIndications(const std::string &nameSpace,
                                const std::string &indicationClass);

    int subscribe(IndicationSubscriber subscriber);
    void unsubscribe(int subscription);

    // Obtains (loading the library and calling the factory on first use) the
    // management interface of a provider: the MI pointer, or null with the
    // reason in `error`.
    void *managementInterface(const std::string &providerName, InterfaceKind kind,
                              std::string *error = nullptr);

    // Calls every obtained interface's cleanup with terminating true, frees
    // every object the broker still owns and unloads the libraries.
    void shutdown();

    // The CMPI broker handle providers receive, and a fresh request context
    // for the namespace, for tests that call factories themselves. The
    // context lives until shutdown.
    const CMPIBroker *cmpiBroker() const;
    const CMPIContext *newContext(const std::string &nameSpace);

    // The providers that prepared a thread context while being loaded (by
    // their factory or initialize), by registered name, in the order seen.
    std::vector<std::string> threadedProviders() const;
    // Waits until every provider thread has released its thread objects at
    // least once (either way) or detached: it has then begun its work. False
    // if `limit` passed first.
    bool awaitFirstThreadReleases(std::chrono::milliseconds limit) const;
    // Every thread context prepared so far, in the order prepared.
    std::vector<ThreadCycles> threadCycles() const;

    const ClassSchema &schema() const;
    const std::vector<ProviderRegistration> &registrations() const;

    // How many objects the broker owns right now (request, thread and
    // unattached objects): zero between requests when providers behave.
    std::size_t liveObjectCount() const;

    struct State;

private:
    std::unique_ptr<State> state;
};

// Reads every registration file, as sfcb serves what several staged
// registrations name together, and every MOF file; throws
// std::runtime_error with a clear message when one cannot be read or
// parsed, or when two files register the same class.
BrokerConfig loadBrokerConfig(const std::vector<std::string> &providerDirs,
                              const std::vector<std::string> &registrationFiles,
                              const std::vector<std::string> &mofFiles);

}  // namespace tvxbroker

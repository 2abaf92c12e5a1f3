// The embedded broker's state, shared by its request dispatch and by the
// CMPI service tables providers call back into.
#pragma once

#include <map>
#include <condition_variable>
#include <mutex>
#include <thread>
#include <string>
#include <vector>

#include "core/Broker.h"
#include "core/EncObjects.h"

namespace tvxbroker {

extern const CMPIBrokerFT brokerFT;
extern const CMPIBrokerEncFT brokerEncFT;
extern const CMPIBrokerExtFT brokerExtFT;
extern const CMPIBrokerMemFT brokerMemFT;

struct LoadedInterface {
    std::string provider;
    InterfaceKind kind;
    void *mi = nullptr;
    std::string error;  // why there is no interface
};

struct LoadedLibrary {
    void *handle = nullptr;
    std::string error;
};

struct Broker::State {
    explicit State(BrokerConfig configuration);

    BrokerConfig config;
    CMPIBroker cmpi{};
    const CMPIContextFT *contextTable;  // of every context made, as the release mode has it

    // Guards the three below; never held while a factory runs, since a
    // provider's initialize may wait for its own threads, whose up-calls
    // load other providers meanwhile.
    std::mutex loadMutex;
    std::condition_variable loadEnded;
    std::map<std::string, LoadedLibrary> libraries;  // by location
    std::vector<LoadedInterface> interfaces;         // in the order obtained
    // Providers whose factory runs now, and on which thread: one factory
    // call at a time per provider, whatever the kind.
    std::map<std::string, std::thread::id> factoriesRunning;

    std::mutex threadMutex;
    std::vector<std::unique_ptr<ThreadContextState>> threadContexts;
    std::vector<std::unique_ptr<EncContext>> spareContexts;
    std::vector<std::string> threadedProviders;

    std::mutex subscriberMutex;
    std::map<int, IndicationSubscriber> subscribers;
    int nextSubscription = 1;

    bool shutDown = false;

    void report(const std::string &text) const;
    void *obtain(const std::string &provider, InterfaceKind kind, std::string *error);
    // The factory call of obtain, with the loading lock released.
    void *callFactory(const std::string &provider, InterfaceKind kind, void *factory,
                      const std::string &symbol, const ProviderRegistration &registration,
                      std::string *error);
    LoadedLibrary &library(const std::string &location);
    CMPIContext *prepareThreadContext(const EncContext &from);
    // Runs one provider call in a request scope of its own.
    // A cleanup call still reaches an interface that shutdown is closing.
    void callProvider(const std::string &provider, InterfaceKind kind, const std::string &nameSpace,
                      Response &response,
                      const std::function<CMPIStatus(void *mi, const CMPIContext *ctx,
                                                     const CMPIResult *rslt)> &call,
                      bool cleanupCall = false);

    // Calls to each interface: shutdown refuses new ones to an interface it
    // closes, waits for those under way, and after its cleanup refuses all.
    struct InterfaceCalls {
        enum Stage { Open, Closing, Closed } stage = Open;
        int inFlight = 0;
    };
    std::mutex callMutex;
    std::condition_variable callEnded;
    std::map<void *, InterfaceCalls> interfaceCalls;
    bool enterCall(void *mi, bool cleanup);
    void leaveCall(void *mi);
    void startClosing(void *mi);
    void markClosed(void *mi);
    bool deliver(const std::string &nameSpace, const Instance &indication);
    void shutdown();
};

std::vector<NamedValue> requestContextEntries(const std::string &nameSpace);

inline Broker::State &stateOf(const CMPIBroker *mb) { return *static_cast<Broker::State *>(mb->hdl); }

}  // namespace tvxbroker

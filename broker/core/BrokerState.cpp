#include "core/BrokerState.h"

#include <dlfcn.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <functional>
#include <memory>

#include "core/EncSupport.h"
#include "model/InstanceOfClass.h"

namespace tvxbroker {

namespace {

const char *kindName(InterfaceKind kind) {
    switch (kind) {
    case InterfaceKind::Instance: return "Instance";
    case InterfaceKind::Association: return "Association";
    case InterfaceKind::Indication: return "Indication";
    }
    return "";
}

const ProviderRegistration *registrationOf(const BrokerConfig &config, const std::string &provider) {
    for (const ProviderRegistration &registration : config.registrations) {
        if (registration.providerName == provider) return &registration;
    }
    return nullptr;
}

void *invokeFactory(void *factory, InterfaceKind kind, CMPIBroker *broker, const CMPIContext *ctx,
                  CMPIStatus *rc) {
    switch (kind) {
    case InterfaceKind::Instance:
        return reinterpret_cast<CMPIInstanceMIFactory>(factory)(broker, ctx, rc);
    case InterfaceKind::Association:
        return reinterpret_cast<CMPIAssociationMIFactory>(factory)(broker, ctx, rc);
    case InterfaceKind::Indication:
        return reinterpret_cast<CMPIIndicationMIFactory>(factory)(broker, ctx, rc);
    }
    return nullptr;
}

CMPIStatus cleanupInterface(void *mi, InterfaceKind kind, const CMPIContext *ctx) {
    switch (kind) {
    case InterfaceKind::Instance: {
        auto *instance = static_cast<CMPIInstanceMI *>(mi);
        return instance->ft->cleanup(instance, ctx, 1);
    }
    case InterfaceKind::Association: {
        auto *association = static_cast<CMPIAssociationMI *>(mi);
        return association->ft->cleanup(association, ctx, 1);
    }
    case InterfaceKind::Indication: {
        auto *indication = static_cast<CMPIIndicationMI *>(mi);
        return indication->ft->cleanup(indication, ctx, 1);
    }
    }
    return enc::status(CMPI_RC_ERR_INVALID_HANDLE);
}

// Names the provider whose factory runs on this thread, so that a thread
// context it prepares is put down to it; null while a provider serves a
// request. Both nest when an initialize makes an up-call.
class LoadingProvider {
public:
    explicit LoadingProvider(const std::string *provider) : previous(current) { current = provider; }
    LoadingProvider(const LoadingProvider &) = delete;
    LoadingProvider &operator=(const LoadingProvider &) = delete;
    ~LoadingProvider() { current = previous; }

    static const std::string *name() { return current; }

private:
    static thread_local const std::string *current;
    const std::string *previous;
};

thread_local const std::string *LoadingProvider::current = nullptr;

std::string messageOf(const CMPIStatus &status) {
    EncString *text = enc::stringOf(status.msg);
    return text != nullptr ? text->text : std::string();
}

}  // namespace

std::vector<NamedValue> requestContextEntries(const std::string &nameSpace) {
    return {NamedValue{CMPIInitNameSpace, CimValue::makeString(nameSpace)},
            NamedValue{CMPIInvocationFlags, CimValue::makeUnsigned(CMPI_uint32, 0)},
            NamedValue{CMPIPrincipal, CimValue::makeString("root")}};
}

Broker::State::State(BrokerConfig configuration)
    : config(std::move(configuration)),
      contextTable(config.threadRelease == ThreadRelease::MarkRelease ? &enc::publishedContextFT
                                                                      : &enc::contextFT.base) {
    cmpi.hdl = this;
    cmpi.bft = &brokerFT;
    cmpi.eft = &brokerEncFT;
    cmpi.xft = &brokerExtFT;
    cmpi.mft = config.threadRelease == ThreadRelease::MarkRelease ? &brokerMemFT : nullptr;
}

LoadedLibrary &Broker::State::library(const std::string &location) {
    auto found = libraries.find(location);
    if (found != libraries.end()) return found->second;
    LoadedLibrary &loaded = libraries[location];
    if (std::find(config.inProcessLocations.begin(), config.inProcessLocations.end(), location) !=
        config.inProcessLocations.end()) {
        loaded.handle = dlopen(nullptr, RTLD_NOW);
        return loaded;
    }
    const std::string file = "lib" + location + ".so";
    for (const std::string &dir : config.providerDirs) {
        const std::string path = dir + "/" + file;
        if (access(path.c_str(), F_OK) != 0) continue;
        loaded.handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
        if (loaded.handle == nullptr) {
            const char *reason = dlerror();
            loaded.error = "cannot load " + path + ": " + (reason != nullptr ? reason : "unknown error");
        }
        return loaded;
    }
    loaded.error = "provider library " + file + " not found in the provider directories";
    return loaded;
}

void Broker::State::report(const std::string &text) const {
    if (config.diagnostics) {
        config.diagnostics(text);
    } else {
        std::fprintf(stderr, "tvxbroker: %s\n", text.c_str());
    }
}

void *Broker::State::obtain(const std::string &provider, InterfaceKind kind, std::string *error) {
    std::unique_lock<std::mutex> lock(loadMutex);
    for (;;) {
        for (const LoadedInterface &known : interfaces) {
            if (known.provider == provider && known.kind == kind) {
                if (error != nullptr) *error = known.error;
                return known.mi;
            }
        }
        const auto busy = factoriesRunning.find(provider);
        if (busy == factoriesRunning.end()) break;
        if (busy->second == std::this_thread::get_id()) {
            // Its own initialize asking for it: there is nothing to hand out yet.
            if (error != nullptr) *error = "provider " + provider + " is still being loaded";
            return nullptr;
        }
        loadEnded.wait(lock);
    }
    LoadedInterface loaded{provider, kind, nullptr, ""};
    const std::string symbol = provider + "_Create_" + kindName(kind) + "MI";
    const ProviderRegistration *registration = registrationOf(config, provider);
    void *factory = nullptr;
    if (shutDown) {
        loaded.error = "the broker has shut down";
    } else if (registration == nullptr) {
        loaded.error = "provider " + provider + " is not registered";
    } else if (LoadedLibrary &lib = library(registration->location); lib.handle == nullptr) {
        loaded.error = "provider " + provider + ": " + lib.error;
    } else if (factory = dlsym(lib.handle, symbol.c_str()); factory == nullptr) {
        loaded.error = "provider " + provider + ": library lib" + registration->location +
                       ".so has no factory " + symbol;
    }
    if (factory != nullptr) {
        factoriesRunning[provider] = std::this_thread::get_id();
        lock.unlock();
        loaded.mi = callFactory(provider, kind, factory, symbol, *registration, &loaded.error);
        lock.lock();
        factoriesRunning.erase(provider);
    }
    if (!loaded.error.empty()) report(loaded.error);
    if (error != nullptr) *error = loaded.error;
    interfaces.push_back(loaded);
    loadEnded.notify_all();
    return loaded.mi;
}

void *Broker::State::callFactory(const std::string &provider, InterfaceKind kind, void *factory,
                                 const std::string &symbol, const ProviderRegistration &registration,
                                 std::string *error) {
    RequestScope scope;
    const std::string nameSpace =
        registration.namespaces.empty() ? "root/cimv2" : registration.namespaces.front();
    CMPIContext *ctx = enc::newContext(contextTable, requestContextEntries(nameSpace));
    CMPIStatus rc = enc::status(CMPI_RC_OK);
    const LoadingProvider announced(&provider);
    try {
        void *mi = invokeFactory(factory, kind, &cmpi, ctx, &rc);
        if (mi == nullptr) *error = "provider " + provider + ": factory " + symbol + " returned no interface";
        return mi;
    } catch (...) {
        *error = "provider " + provider + ": factory " + symbol + " failed with an exception";
    }
    return nullptr;
}

CMPIContext *Broker::State::prepareThreadContext(const EncContext &from) {
    auto thread = std::make_unique<ThreadContextState>();
    thread->context = enc::makeContext(contextTable, from.entries);
    thread->context->thread = thread.get();
    CMPIContext *handle = &thread->context->cmpi;
    std::lock_guard<std::mutex> lock(threadMutex);
    threadContexts.push_back(std::move(thread));
    const std::string *loading = LoadingProvider::name();
    if (loading == nullptr) return handle;
    threadContexts.back()->provider = *loading;
    if (std::find(threadedProviders.begin(), threadedProviders.end(), *loading) == threadedProviders.end()) {
        threadedProviders.push_back(*loading);
    }
    return handle;
}

bool Broker::State::enterCall(void *mi, bool cleanup) {
    const std::lock_guard<std::mutex> lock(callMutex);
    InterfaceCalls &calls = interfaceCalls[mi];
    if (calls.stage == InterfaceCalls::Closed || (calls.stage == InterfaceCalls::Closing && !cleanup)) return false;
    ++calls.inFlight;
    return true;
}

void Broker::State::leaveCall(void *mi) {
    const std::lock_guard<std::mutex> lock(callMutex);
    --interfaceCalls[mi].inFlight;
    callEnded.notify_all();
}

void Broker::State::startClosing(void *mi) {
    std::unique_lock<std::mutex> lock(callMutex);
    InterfaceCalls &calls = interfaceCalls[mi];
    calls.stage = InterfaceCalls::Closing;
    // A provider's thread may be in an up-call to this interface.
    callEnded.wait(lock, [&] { return calls.inFlight == 0; });
}

void Broker::State::markClosed(void *mi) {
    const std::lock_guard<std::mutex> lock(callMutex);
    interfaceCalls[mi].stage = InterfaceCalls::Closed;
}

void Broker::State::callProvider(
    const std::string &provider, InterfaceKind kind, const std::string &nameSpace,
    Response &response,
    const std::function<CMPIStatus(void *, const CMPIContext *, const CMPIResult *)> &call,
    bool cleanupCall) {
    std::string error;
    void *mi = obtain(provider, kind, &error);
    if (mi == nullptr || !enterCall(mi, cleanupCall)) {
        response.rc = CMPI_RC_ERR_FAILED;
        response.message = mi == nullptr ? error : "the broker has shut down";
        return;
    }
    struct Leave {
        State &state;
        void *mi;
        ~Leave() { state.leaveCall(mi); }
    } const leave{*this, mi};
    RequestScope scope;
    CMPIContext *ctx = enc::newContext(contextTable, requestContextEntries(nameSpace));
    EncResult result;
    enc::bindResult(result, response);
    const std::size_t first = response.instances.size();
    const LoadingProvider serving(nullptr);
    try {
        const CMPIStatus status = call(mi, ctx, &result.cmpi);
        response.rc = status.rc;
        if (status.msg != nullptr) response.message = messageOf(status);
    } catch (...) {
        response.rc = CMPI_RC_ERR_FAILED;
        response.message = "provider " + provider + " let an exception escape through CMPI";
    }
    // However a provider built its instances, a client of sfcb gets each on
    // the path its class's key properties make. Like sfcb, the broker leaves
    // a property list to the providers' filters.
    for (std::size_t index = first; index < response.instances.size(); ++index) {
        Instance &instance = response.instances[index];
        instance.path = pathFromClassKeys(instance, config.schema);
    }
}

bool Broker::State::deliver(const std::string &nameSpace, const Instance &indication) {
    std::lock_guard<std::mutex> lock(subscriberMutex);
    bool accepted = true;
    for (auto &entry : subscribers) {
        if (!entry.second(nameSpace, indication)) accepted = false;
    }
    return accepted;
}

void Broker::State::shutdown() {
    std::vector<LoadedInterface> loaded;
    {
        std::unique_lock<std::mutex> lock(loadMutex);
        if (shutDown) return;
        shutDown = true;
        // A factory running now (say for a provider thread's up-call) still
        // gets its interface listed, and so cleaned up.
        loadEnded.wait(lock, [&] { return factoriesRunning.empty(); });
        loaded = interfaces;
    }
    for (auto it = loaded.rbegin(); it != loaded.rend(); ++it) {
        if (it->mi == nullptr) continue;
        startClosing(it->mi);
        Response ignored;
        callProvider(it->provider, it->kind, "root/cimv2", ignored,
                     [&](void *mi, const CMPIContext *ctx, const CMPIResult *) {
                         return cleanupInterface(mi, it->kind, ctx);
                     },
                     true);
        markClosed(it->mi);
        if (!ignored.ok()) {
            report("cleanup of provider " + it->provider + " answered " +
                   std::to_string(static_cast<int>(ignored.rc)));
        }
    }
    {
        std::lock_guard<std::mutex> lock(threadMutex);
        threadContexts.clear();
        spareContexts.clear();
    }
    ObjectPool::processPool().releaseAll();
    std::lock_guard<std::mutex> lock(loadMutex);
    for (auto &entry : libraries) {
        if (entry.second.handle != nullptr) dlclose(entry.second.handle);
    }
    libraries.clear();
}

}  // namespace tvxbroker

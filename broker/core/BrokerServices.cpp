// The broker function table: thread attachment, indication delivery and
// up-calls, which re-enter request routing with the caller's objects kept.
#include <cstdlib>

#include "core/EncSupport.h"
#include "core/Requests.h"

namespace tvxbroker {

namespace {

using enc::setRc;

PropertyList propertyListOf(const char **properties) {
    if (properties == nullptr) return std::nullopt;
    std::vector<std::string> names;
    for (const char **name = properties; *name != nullptr; ++name) names.emplace_back(*name);
    return names;
}

// Hands an up-call's answer to the calling provider as an enumeration owned
// by the caller's current pool.
CMPIEnumeration *answer(const Response &response, bool wantPaths, CMPIStatus *rc) {
    if (!response.ok()) {
        if (response.message) {
            setRc(rc, response.rc, *response.message);
        } else {
            setRc(rc, response.rc);
        }
        return nullptr;
    }
    std::vector<CimValue> items;
    if (wantPaths) {
        for (const ObjectPath &path : response.paths) items.push_back(CimValue::makeReference(path));
    } else {
        for (const Instance &instance : response.instances) {
            CimValue item = CimValue::makeNull(CMPI_instance);
            item.null = false;
            item.instance = std::make_shared<Instance>(instance);
            items.push_back(std::move(item));
        }
    }
    setRc(rc, CMPI_RC_OK);
    return enc::newEnumeration(std::move(items));
}

const ObjectPath *pathArgument(const CMPIObjectPath *op, CMPIStatus *rc) {
    EncObjectPath *path = enc::pathOf(op);
    if (path == nullptr) setRc(rc, CMPI_RC_ERR_INVALID_HANDLE, "not an object path of this broker");
    return path != nullptr ? &path->value : nullptr;
}

CMPIContext *prepareAttachThread(const CMPIBroker *mb, const CMPIContext *ctx) {
    EncContext *context = enc::contextOf(ctx);
    return context == nullptr ? nullptr : stateOf(mb).prepareThreadContext(*context);
}

CMPIStatus attachThread(const CMPIBroker *, const CMPIContext *ctx) {
    EncContext *context = enc::contextOf(ctx);
    if (context == nullptr || context->thread == nullptr) {
        return enc::status(CMPI_RC_ERR_INVALID_HANDLE, "context was not prepared for a thread");
    }
    ObjectPool::setCurrent(&context->thread->pool);
    return enc::status(CMPI_RC_OK);
}

CMPIStatus detachThread(const CMPIBroker *, const CMPIContext *ctx) {
    EncContext *context = enc::contextOf(ctx);
    if (context == nullptr || context->thread == nullptr) {
        return enc::status(CMPI_RC_ERR_INVALID_HANDLE, "context was not prepared for a thread");
    }
    if (ObjectPool::currentOrNull() == &context->thread->pool) ObjectPool::setCurrent(nullptr);
    context->thread->pool.releaseAll();
    return enc::status(CMPI_RC_OK);
}

CMPIStatus deliverIndication(const CMPIBroker *mb, const CMPIContext *, const char *ns,
                             const CMPIInstance *ind) {
    EncInstance *instance = enc::instanceOf(ind);
    if (instance == nullptr) return enc::status(CMPI_RC_ERR_INVALID_HANDLE);
    if (!stateOf(mb).deliver(ns != nullptr ? ns : "", instance->value)) {
        return enc::status(CMPI_RC_ERR_FAILED, "the indication was refused");
    }
    return enc::status(CMPI_RC_OK);
}

CMPIEnumeration *enumerateInstanceNames(const CMPIBroker *mb, const CMPIContext *,
                                        const CMPIObjectPath *op, CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    if (path == nullptr) return nullptr;
    return answer(requests::enumInstanceNames(stateOf(mb), *path), true, rc);
}

CMPIEnumeration *enumerateInstances(const CMPIBroker *mb, const CMPIContext *,
                                    const CMPIObjectPath *op, const char **properties,
                                    CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    if (path == nullptr) return nullptr;
    return answer(requests::enumInstances(stateOf(mb), *path, propertyListOf(properties)), false,
                  rc);
}

CMPIInstance *getInstance(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op,
                          const char **properties, CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    if (path == nullptr) return nullptr;
    Broker::State &state = stateOf(mb);
    const Response response = requests::getInstance(state, *path, propertyListOf(properties));
    if (response.ok() && response.instances.empty()) {
        // sfcb takes the first instance of an OK answer to an up-call
        // without looking, and its provider process dies of the one that
        // is not there: so must the caller here, or tests would hide it.
        state.report("up-call getInstance of an instance of " + path->className +
                     " was answered OK without an instance; sfcb's provider process dies here");
        std::abort();
    }
    if (!response.ok()) {
        answer(response, false, rc);
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    return enc::newInstance(response.instances.front());
}

CMPIObjectPath *createInstance(const CMPIBroker *mb, const CMPIContext *,
                               const CMPIObjectPath *op, const CMPIInstance *inst,
                               CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    EncInstance *instance = enc::instanceOf(inst);
    if (path == nullptr || instance == nullptr) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    const Response response = requests::createInstance(stateOf(mb), *path, instance->value);
    if (!response.ok()) {
        answer(response, true, rc);
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    return enc::newObjectPath(response.paths.empty() ? *path : response.paths.front());
}

CMPIStatus statusOf(const Response &response) {
    return response.message ? enc::status(response.rc, *response.message) : enc::status(response.rc);
}

CMPIStatus modifyInstance(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op,
                          const CMPIInstance *inst, const char **properties) {
    EncObjectPath *path = enc::pathOf(op);
    EncInstance *instance = enc::instanceOf(inst);
    if (path == nullptr || instance == nullptr) return enc::status(CMPI_RC_ERR_INVALID_HANDLE);
    return statusOf(requests::setInstance(stateOf(mb), path->value, instance->value,
                                          propertyListOf(properties)));
}

CMPIStatus deleteInstance(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op) {
    EncObjectPath *path = enc::pathOf(op);
    if (path == nullptr) return enc::status(CMPI_RC_ERR_INVALID_HANDLE);
    return statusOf(requests::deleteInstance(stateOf(mb), path->value));
}

CMPIEnumeration *execQuery(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op,
                           const char *query, const char *lang, CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    if (path == nullptr) return nullptr;
    return answer(requests::execQuery(stateOf(mb), *path, query != nullptr ? query : "",
                                      lang != nullptr ? lang : ""),
                  false, rc);
}

std::string text(const char *value) { return value != nullptr ? value : ""; }

CMPIEnumeration *associationUpCall(const CMPIBroker *mb, requests::AssociationCall call,
                                   const CMPIObjectPath *op, requests::AssociationFilter filter,
                                   const char **properties, bool wantPaths, CMPIStatus *rc) {
    const ObjectPath *path = pathArgument(op, rc);
    if (path == nullptr) return nullptr;
    return answer(requests::association(stateOf(mb), call, *path, filter,
                                        propertyListOf(properties)),
                  wantPaths, rc);
}

CMPIEnumeration *associators(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op,
                             const char *assocClass, const char *resultClass, const char *role,
                             const char *resultRole, const char **properties, CMPIStatus *rc) {
    return associationUpCall(mb, requests::AssociationCall::Associators, op,
                             {text(assocClass), text(resultClass), text(role), text(resultRole)},
                             properties, false, rc);
}

CMPIEnumeration *associatorNames(const CMPIBroker *mb, const CMPIContext *,
                                 const CMPIObjectPath *op, const char *assocClass,
                                 const char *resultClass, const char *role,
                                 const char *resultRole, CMPIStatus *rc) {
    return associationUpCall(mb, requests::AssociationCall::AssociatorNames, op,
                             {text(assocClass), text(resultClass), text(role), text(resultRole)},
                             nullptr, true, rc);
}

CMPIEnumeration *references(const CMPIBroker *mb, const CMPIContext *, const CMPIObjectPath *op,
                            const char *resultClass, const char *role, const char **properties,
                            CMPIStatus *rc) {
    return associationUpCall(mb, requests::AssociationCall::References, op,
                             {"", text(resultClass), text(role), ""}, properties, false, rc);
}

CMPIEnumeration *referenceNames(const CMPIBroker *mb, const CMPIContext *,
                                const CMPIObjectPath *op, const char *resultClass,
                                const char *role, CMPIStatus *rc) {
    return associationUpCall(mb, requests::AssociationCall::ReferenceNames, op,
                             {"", text(resultClass), text(role), ""}, nullptr, true, rc);
}

CMPIData invokeMethod(const CMPIBroker *, const CMPIContext *, const CMPIObjectPath *,
                      const char *, const CMPIArgs *, CMPIArgs *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return enc::notFoundData();
}

CMPIStatus setProperty(const CMPIBroker *, const CMPIContext *, const CMPIObjectPath *,
                       const char *, const CMPIValue *, CMPIType) {
    return enc::status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIData getProperty(const CMPIBroker *, const CMPIContext *, const CMPIObjectPath *,
                     const char *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return enc::notFoundData();
}

}  // namespace

const CMPIBrokerFT brokerFT = {CMPI_MB_Class_2,
                               CMPICurrentVersion,
                               "tvxbroker",
                               prepareAttachThread,
                               attachThread,
                               detachThread,
                               deliverIndication,
                               enumerateInstanceNames,
                               getInstance,
                               createInstance,
                               modifyInstance,
                               deleteInstance,
                               execQuery,
                               enumerateInstances,
                               associators,
                               associatorNames,
                               references,
                               referenceNames,
                               invokeMethod,
                               setProperty,
                               getProperty};

}  // namespace tvxbroker

#include "core/Requests.h"

#include <algorithm>
#include <iterator>

#include "core/EncSupport.h"

namespace tvxbroker::requests {

namespace {

// A CMPI property list that lives as long as this object.
class CPropertyList {
public:
    explicit CPropertyList(const PropertyList &properties) {
        if (!properties) return;
        for (const std::string &name : *properties) pointers.push_back(name.c_str());
        pointers.push_back(nullptr);
    }
    const char **get() { return pointers.empty() ? nullptr : pointers.data(); }

private:
    std::vector<const char *> pointers;
};

const char *orNull(const std::string &text) { return text.empty() ? nullptr : text.c_str(); }

bool servesNamespace(const ProviderRegistration &registration, const std::string &nameSpace) {
    for (const std::string &served : registration.namespaces) {
        if (equalsIgnoreCase(served, nameSpace)) return true;
    }
    return false;
}

// Providers of the kind registered for the class (and, when asked, for its
// subclasses; an empty class name means any class), once each, in
// registration order.
std::vector<std::string> providersFor(const Broker::State &state, bool ProviderRegistration::*kind,
                                      const std::string &className, const std::string &nameSpace,
                                      bool withSubclasses) {
    std::vector<std::string> providers;
    for (const ProviderRegistration &registration : state.config.registrations) {
        if (!(registration.*kind) || !servesNamespace(registration, nameSpace)) continue;
        const bool matches = className.empty() ||
                             (withSubclasses
                                  ? state.config.schema.isA(registration.className, className)
                                  : equalsIgnoreCase(registration.className, className));
        if (!matches) continue;
        bool known = false;
        for (const std::string &provider : providers) known = known || provider == registration.providerName;
        if (!known) providers.push_back(registration.providerName);
    }
    return providers;
}

bool knownClass(const Broker::State &state, const std::string &className, Response &response) {
    if (state.config.schema.find(className) != nullptr) return true;
    response.rc = CMPI_RC_ERR_INVALID_CLASS;
    response.message = "unknown class " + className;
    return false;
}

using InstanceCall = std::function<CMPIStatus(CMPIInstanceMI *, const CMPIContext *,
                                              const CMPIResult *, CMPIObjectPath *)>;

struct InstanceTarget {
    std::string provider;
    std::string className;
};

// As sfcb does, an enumeration asks each provider once for every registered
// class below the requested one, naming that class in the path; a request on
// one instance asks the providers of its own class.
std::vector<InstanceTarget> instanceTargets(const Broker::State &state, const ObjectPath &path,
                                            bool withSubclasses) {
    std::vector<InstanceTarget> targets;
    if (!withSubclasses) {
        for (const std::string &provider : providersFor(state, &ProviderRegistration::instance,
                                                        path.className, path.nameSpace, false)) {
            targets.push_back({provider, path.className});
        }
        return targets;
    }
    for (const ProviderRegistration &registration : state.config.registrations) {
        if (!registration.instance || !servesNamespace(registration, path.nameSpace) ||
            !state.config.schema.isA(registration.className, path.className)) {
            continue;
        }
        bool known = false;
        for (const InstanceTarget &target : targets) {
            known = known || (target.provider == registration.providerName &&
                              equalsIgnoreCase(target.className, registration.className));
        }
        // sfcb names the registered class only where it differs beyond letter case.
        const bool requested = equalsIgnoreCase(registration.className, path.className);
        if (!known) targets.push_back({registration.providerName, requested ? path.className : registration.className});
    }
    return targets;
}

// Asks every instance provider in turn, stopping at the first error.
Response askInstanceProviders(Broker::State &state, const ObjectPath &path, bool withSubclasses,
                              const InstanceCall &call) {
    Response response;
    if (!knownClass(state, path.className, response)) return response;
    const std::vector<InstanceTarget> targets = instanceTargets(state, path, withSubclasses);
    if (targets.empty() && !withSubclasses) {
        response.rc = CMPI_RC_ERR_NOT_SUPPORTED;
        response.message = "no instance provider serves class " + path.className;
    }
    for (const InstanceTarget &target : targets) {
        ObjectPath targetPath = path;
        targetPath.className = target.className;
        state.callProvider(target.provider, InterfaceKind::Instance, path.nameSpace, response,
                           [&](void *mi, const CMPIContext *ctx, const CMPIResult *rslt) {
                               return call(static_cast<CMPIInstanceMI *>(mi), ctx, rslt,
                                           enc::newObjectPath(targetPath));
                           });
        if (!response.ok()) break;
    }
    return response;
}

}  // namespace

Response enumInstanceNames(Broker::State &state, const ObjectPath &classPath) {
    return askInstanceProviders(state, classPath, true,
                                [](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                   const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->enumerateInstanceNames(mi, ctx, rslt, op);
                                });
}

Response enumInstances(Broker::State &state, const ObjectPath &classPath,
                       const PropertyList &properties) {
    CPropertyList list(properties);
    return askInstanceProviders(state, classPath, true,
                                [&](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->enumerateInstances(mi, ctx, rslt, op, list.get());
                                });
}

Response getInstance(Broker::State &state, const ObjectPath &path, const PropertyList &properties) {
    CPropertyList list(properties);
    return askInstanceProviders(state, path, false,
                                [&](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->getInstance(mi, ctx, rslt, op, list.get());
                                });
}

Response createInstance(Broker::State &state, const ObjectPath &path, const Instance &instance) {
    return askInstanceProviders(state, path, false,
                                [&](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->createInstance(mi, ctx, rslt, op,
                                                                  enc::newInstance(instance));
                                });
}

Response setInstance(Broker::State &state, const ObjectPath &path, const Instance &instance,
                     const PropertyList &properties) {
    CPropertyList list(properties);
    return askInstanceProviders(state, path, false,
                                [&](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->modifyInstance(mi, ctx, rslt, op,
                                                                  enc::newInstance(instance),
                                                                  list.get());
                                });
}

Response deleteInstance(Broker::State &state, const ObjectPath &path) {
    return askInstanceProviders(state, path, false,
                                [](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                   const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->deleteInstance(mi, ctx, rslt, op);
                                });
}

Response execQuery(Broker::State &state, const ObjectPath &classPath, const std::string &query,
                   const std::string &language) {
    return askInstanceProviders(state, classPath, true,
                                [&](CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt, CMPIObjectPath *op) {
                                    return mi->ft->execQuery(mi, ctx, rslt, op, query.c_str(),
                                                             language.c_str());
                                });
}

Response association(Broker::State &state, AssociationCall call, const ObjectPath &path,
                     const AssociationFilter &filter, const PropertyList &properties) {
    Response response;
    if (!knownClass(state, path.className, response)) return response;
    // References name the association class as their result class.
    const bool referenceCall =
        call == AssociationCall::References || call == AssociationCall::ReferenceNames;
    const std::string &routingClass = referenceCall ? filter.resultClass : filter.assocClass;
    if (!routingClass.empty() && !knownClass(state, routingClass, response)) return response;
    // Without an association class every association provider is asked, as
    // sfcb does; each answers only for the objects it knows.
    const std::vector<std::string> providers = providersFor(
        state, &ProviderRegistration::association, routingClass, path.nameSpace, true);
    CPropertyList list(properties);
    for (const std::string &provider : providers) {
        state.callProvider(
            provider, InterfaceKind::Association, path.nameSpace, response,
            [&](void *handle, const CMPIContext *ctx, const CMPIResult *rslt) {
                auto *mi = static_cast<CMPIAssociationMI *>(handle);
                CMPIObjectPath *op = enc::newObjectPath(path);
                switch (call) {
                case AssociationCall::Associators:
                    return mi->ft->associators(mi, ctx, rslt, op, orNull(filter.assocClass),
                                               orNull(filter.resultClass), orNull(filter.role),
                                               orNull(filter.resultRole), list.get());
                case AssociationCall::AssociatorNames:
                    return mi->ft->associatorNames(mi, ctx, rslt, op, orNull(filter.assocClass),
                                                   orNull(filter.resultClass), orNull(filter.role),
                                                   orNull(filter.resultRole));
                case AssociationCall::References:
                    return mi->ft->references(mi, ctx, rslt, op, orNull(filter.resultClass),
                                              orNull(filter.role), list.get());
                case AssociationCall::ReferenceNames:
                    return mi->ft->referenceNames(mi, ctx, rslt, op, orNull(filter.resultClass),
                                                  orNull(filter.role));
                }
                return enc::status(CMPI_RC_ERR_NOT_SUPPORTED);
            });
        if (!response.ok()) break;
    }
    return response;
}

// sfcb hands a subscription to providers only for these classes and theirs.
bool forwardedIndication(const ClassSchema &schema, const std::string &className) {
    static const char *const forwarded[] = {"CIM_ProcessIndication", "CIM_InstCreation", "CIM_InstDeletion",
                                            "CIM_InstModification"};
    return std::any_of(std::begin(forwarded), std::end(forwarded),
                       [&](const char *ancestor) { return schema.isA(className, ancestor); });
}

Response indication(Broker::State &state, IndicationCall call, const IndicationRequest &request) {
    Response response;
    if (!knownClass(state, request.indicationClass, response)) return response;
    std::vector<std::string> providers =
        providersFor(state, &ProviderRegistration::indication, request.indicationClass,
                     request.nameSpace, true);
    if (!forwardedIndication(state.config.schema, request.indicationClass)) providers.clear();
    if (providers.empty()) {
        response.rc = CMPI_RC_ERR_NOT_SUPPORTED;
        response.message = "No supported indication classes in filter query or no provider found";
    }
    for (const std::string &provider : providers) {
        state.callProvider(
            provider, InterfaceKind::Indication, request.nameSpace, response,
            [&](void *handle, const CMPIContext *ctx, const CMPIResult *) {
                auto *mi = static_cast<CMPIIndicationMI *>(handle);
                CMPISelectExp *filter = enc::newSelectExp(request.query, "WQL");
                CMPIObjectPath *op =
                    enc::newObjectPath(ObjectPath{"", request.nameSpace, request.indicationClass, {}});
                const char *className = request.indicationClass.c_str();
                const CMPIBoolean flag = request.flag ? 1 : 0;
                switch (call) {
                case IndicationCall::Authorize:
                    return mi->ft->authorizeFilter(mi, ctx, filter, className, op,
                                                   request.owner.c_str());
                case IndicationCall::MustPoll:
                    return mi->ft->mustPoll(mi, ctx, filter, className, op);
                case IndicationCall::Activate:
                    return mi->ft->activateFilter(mi, ctx, filter, className, op, flag);
                case IndicationCall::Deactivate:
                    return mi->ft->deActivateFilter(mi, ctx, filter, className, op, flag);
                case IndicationCall::Enable: return mi->ft->enableIndications(mi, ctx);
                case IndicationCall::Disable: return mi->ft->disableIndications(mi, ctx);
                }
                return enc::status(CMPI_RC_ERR_NOT_SUPPORTED);
            });
        if (!response.ok()) break;
    }
    return response;
}

}  // namespace tvxbroker::requests

// Answers as a client compares them: an object path by its canonical text,
// whatever spelling, key order or key value type a provider used, and an
// instance by the name a client builds from its key properties.
#pragma once

#include <algorithm>
#include <chrono>
#include <set>
#include <string>
#include <vector>

#include "core/Broker.h"
#include "model/PathText.h"

namespace consistency {

using namespace tvxbroker;

// The namespace in lower case, class and key names as the MOF declares them,
// keys in name order (references within likewise) and no host.
inline ObjectPath canonicalPath(const ObjectPath &path, const ClassSchema &schema) {
    const ClassDecl *decl = schema.find(path.className);
    ObjectPath canonical{"", toLowerAscii(path.nameSpace), decl != nullptr ? decl->name : path.className, {}};
    for (const NamedValue &key : path.keys) {
        const PropertyDecl *declared = schema.findProperty(path.className, key.name);
        const bool reference = key.value.type == CMPI_ref && !key.value.null && key.value.reference;
        canonical.keys.push_back({declared != nullptr ? declared->name : key.name,
                                  reference ? CimValue::makeReference(canonicalPath(*key.value.reference, schema))
                                            : key.value});
    }
    std::sort(canonical.keys.begin(), canonical.keys.end(),
              [](const NamedValue &a, const NamedValue &b) { return toLowerAscii(a.name) < toLowerAscii(b.name); });
    return canonical;
}

inline std::string canonicalText(const ObjectPath &path, const ClassSchema &schema) {
    return formatPath(canonicalPath(path, schema));
}

// The instance's class and namespace with the values of every key property
// the MOF declares for its class; a key the instance lacks is left out.
inline ObjectPath nameOf(const Instance &instance, const ClassSchema &schema) {
    ObjectPath name{"", instance.path.nameSpace, instance.path.className, {}};
    for (const PropertyDecl &key : schema.keysOf(instance.path.className)) {
        if (const CimValue *value = instance.property(key.name)) name.keys.push_back({key.name, *value});
    }
    return name;
}

// Makes the broker one that has served a while: every instance provider
// loaded and its threads past their first cycle. A thread's first release
// of its objects means it is inside its first cycle, holding its provider's
// lock; a request to that provider then waits for the cycle to end. False
// if the threads did not get that far within `limit`.
inline bool loadInstanceProviders(Broker &broker, std::chrono::milliseconds limit) {
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (registration.instance) broker.managementInterface(registration.providerName, InterfaceKind::Instance);
    }
    if (!broker.awaitFirstThreadReleases(limit)) return false;
    const std::vector<std::string> threaded = broker.threadedProviders();
    for (const ProviderRegistration &registration : broker.registrations()) {
        if (registration.instance &&
            std::find(threaded.begin(), threaded.end(), registration.providerName) != threaded.end()) {
            broker.enumInstanceNames(ObjectPath{"", registration.namespaces.front(), registration.className, {}});
        }
    }
    return true;
}

// For each end of the association, the first instance of the class that end
// refers to (in `nameSpace`) that takes part in one; an end without such an
// instance adds nothing.
inline std::vector<ObjectPath> associationStarts(Broker &broker, const std::string &associationClass,
                                                 const std::string &nameSpace) {
    std::vector<ObjectPath> starts;
    std::set<std::string> roles;  // inherited ones too, each once
    for (const ClassDecl *decl = broker.schema().find(associationClass); decl != nullptr;
         decl = broker.schema().find(decl->superclass)) {
        for (const PropertyDecl &role : decl->properties) {
            if (role.type != CMPI_ref || !roles.insert(toLowerAscii(role.name)).second) continue;
            const Response names = broker.enumInstanceNames(ObjectPath{"", nameSpace, role.referenceClass, {}});
            for (const ObjectPath &name : names.paths) {
                const Response associated = broker.associatorNames(name, associationClass, "", "", "");
                if (associated.ok() && !associated.paths.empty()) {
                    starts.push_back(name);
                    break;
                }
            }
        }
    }
    return starts;
}

}  // namespace consistency

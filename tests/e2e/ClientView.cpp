#include "ClientView.h"

#include <algorithm>
#include <set>

#include "model/PathText.h"

namespace consistency {

using namespace tvxbroker;

namespace {

ObjectPath canonicalPath(const ObjectPath &path, const ClassSchema &schema) {
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

}  // namespace

std::string canonicalText(const ObjectPath &path, const ClassSchema &schema) {
    return formatPath(canonicalPath(path, schema));
}

ObjectPath nameOf(const Instance &instance, const ClassSchema &schema) {
    ObjectPath name{"", instance.path.nameSpace, instance.path.className, {}};
    for (const PropertyDecl &key : schema.keysOf(instance.path.className)) {
        if (const CimValue *value = instance.property(key.name)) name.keys.push_back({key.name, *value});
    }
    return name;
}

std::vector<PropertyDecl> rolesOf(const std::string &associationClass, const ClassSchema &schema) {
    std::vector<PropertyDecl> roles;
    std::set<std::string> seen;
    for (const ClassDecl *decl = schema.find(associationClass); decl != nullptr; decl = schema.find(decl->superclass)) {
        for (const PropertyDecl &property : decl->properties) {
            if (property.type == CMPI_ref && seen.insert(toLowerAscii(property.name)).second) roles.push_back(property);
        }
    }
    return roles;
}

}  // namespace consistency

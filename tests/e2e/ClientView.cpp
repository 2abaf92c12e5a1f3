#include "ClientView.h"

#include <algorithm>
#include <set>

#include "model/PathText.h"

namespace consistency {

using tvxbroker::ClassSchema;
using tvxbroker::CimValue;
using tvxbroker::Instance;
using tvxbroker::NamedValue;
using tvxbroker::ObjectPath;

namespace {

std::string declaredClass(const std::string &className, const ClassSchema &schema) {
    const tvxbroker::ClassDecl *decl = schema.find(className);
    return decl != nullptr ? decl->name : className;
}

ObjectPath canonicalPath(const ObjectPath &path, const ClassSchema &schema) {
    ObjectPath canonical{"", tvxbroker::toLowerAscii(path.nameSpace), declaredClass(path.className, schema), {}};
    for (const NamedValue &key : path.keys) {
        const tvxbroker::PropertyDecl *decl = schema.findProperty(path.className, key.name);
        const std::string name = decl != nullptr ? decl->name : key.name;
        const bool reference = key.value.type == CMPI_ref && !key.value.null && key.value.reference;
        canonical.keys.push_back(
            {name, reference ? CimValue::makeReference(canonicalPath(*key.value.reference, schema)) : key.value});
    }
    std::sort(canonical.keys.begin(), canonical.keys.end(), [](const NamedValue &a, const NamedValue &b) {
        return tvxbroker::toLowerAscii(a.name) < tvxbroker::toLowerAscii(b.name);
    });
    return canonical;
}

}  // namespace

std::string canonicalText(const ObjectPath &path, const ClassSchema &schema) {
    return tvxbroker::formatPath(canonicalPath(path, schema));
}

std::vector<std::string> canonicalTexts(const std::vector<ObjectPath> &paths, const ClassSchema &schema) {
    std::vector<std::string> texts;
    for (const ObjectPath &path : paths) texts.push_back(canonicalText(path, schema));
    return texts;
}

ObjectPath nameOf(const Instance &instance, const ClassSchema &schema) {
    ObjectPath name{"", instance.path.nameSpace, instance.path.className, {}};
    for (const tvxbroker::PropertyDecl &key : schema.keysOf(instance.path.className)) {
        if (const CimValue *value = instance.property(key.name)) name.keys.push_back({key.name, *value});
    }
    return name;
}

std::vector<std::string> canonicalNames(const std::vector<Instance> &instances, const ClassSchema &schema) {
    std::vector<std::string> texts;
    for (const Instance &instance : instances) texts.push_back(canonicalText(nameOf(instance, schema), schema));
    return texts;
}

std::vector<Role> rolesOf(const std::string &associationClass, const ClassSchema &schema) {
    std::vector<Role> roles;
    std::set<std::string> seen;
    for (const tvxbroker::ClassDecl *decl = schema.find(associationClass); decl != nullptr;
         decl = decl->superclass.empty() ? nullptr : schema.find(decl->superclass)) {
        for (const tvxbroker::PropertyDecl &property : decl->properties) {
            if (property.type == CMPI_ref && seen.insert(tvxbroker::toLowerAscii(property.name)).second) {
                roles.push_back({property.name, property.referenceClass});
            }
        }
    }
    return roles;
}

}  // namespace consistency

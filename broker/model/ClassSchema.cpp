#include "model/ClassSchema.h"

#include <algorithm>
#include <utility>

#include "model/CimValue.h"
#include "model/MofClassReader.h"
#include "model/TextSource.h"

namespace tvxbroker {

void ClassSchema::loadText(const std::string &text, const std::string &origin) {
    std::vector<ClassAtLine> parsed = readMofClasses(text, origin);
    const std::size_t before = classes_.size();
    try {
        for (ClassAtLine &entry : parsed) add(std::move(entry.decl), origin, entry.line);
    } catch (...) {
        while (classes_.size() > before) removeLast();
        throw;
    }
}

void ClassSchema::loadFile(const std::string &path) { loadText(readTextFile(path), path); }

void ClassSchema::add(ClassDecl decl, const std::string &origin, int line) {
    std::string lowerName = toLowerAscii(decl.name);
    if (byLowerName_.count(lowerName)) throwAt(origin, line, "class " + decl.name + " is already declared");
    if (!decl.superclass.empty()) {
        const ClassDecl *super = find(decl.superclass);
        if (!super) throwAt(origin, line, "superclass " + decl.superclass + " of " + decl.name + " is not declared");
        decl.superclass = super->name;
        // Key cannot be overridden, so a redeclared key property stays a key.
        for (PropertyDecl &property : decl.properties) {
            const PropertyDecl *inherited = findProperty(super->name, property.name);
            if (inherited && inherited->key) property.key = true;
        }
    }
    classes_.push_back(std::move(decl));
    byLowerName_.emplace(std::move(lowerName), classes_.size() - 1);
}

void ClassSchema::removeLast() {
    byLowerName_.erase(toLowerAscii(classes_.back().name));
    classes_.pop_back();
}

const ClassDecl *ClassSchema::find(const std::string &name) const {
    const auto found = byLowerName_.find(toLowerAscii(name));
    return found == byLowerName_.end() ? nullptr : &classes_[found->second];
}

std::vector<const ClassDecl *> ClassSchema::chainOf(const std::string &cls) const {
    std::vector<const ClassDecl *> chain;
    for (const ClassDecl *decl = find(cls); decl; decl = decl->superclass.empty() ? nullptr : find(decl->superclass)) {
        chain.push_back(decl);
    }
    return chain;
}

bool ClassSchema::isA(const std::string &cls, const std::string &ancestor) const {
    const auto chain = chainOf(cls);
    return std::any_of(chain.begin(), chain.end(),
                       [&](const ClassDecl *decl) { return equalsIgnoreCase(decl->name, ancestor); });
}

std::vector<std::string> ClassSchema::selfAndSubclasses(const std::string &cls) const {
    std::vector<std::string> names;
    for (const ClassDecl &decl : classes_) {
        if (isA(decl.name, cls)) names.push_back(decl.name);
    }
    return names;
}

const PropertyDecl *ClassSchema::findProperty(const std::string &cls, const std::string &prop) const {
    for (const ClassDecl *decl : chainOf(cls)) {
        for (const PropertyDecl &property : decl->properties) {
            if (equalsIgnoreCase(property.name, prop)) return &property;
        }
    }
    return nullptr;
}

std::vector<PropertyDecl> ClassSchema::propertiesOf(const std::string &cls) const {
    const auto chain = chainOf(cls);
    std::vector<PropertyDecl> properties;
    for (auto decl = chain.rbegin(); decl != chain.rend(); ++decl) {
        for (const PropertyDecl &property : (*decl)->properties) {
            const bool seen = std::any_of(properties.begin(), properties.end(), [&](const PropertyDecl &known) {
                return equalsIgnoreCase(known.name, property.name);
            });
            if (!seen) properties.push_back(*findProperty(cls, property.name));
        }
    }
    return properties;
}

std::vector<PropertyDecl> ClassSchema::keysOf(const std::string &cls) const {
    std::vector<PropertyDecl> keys = propertiesOf(cls);
    keys.erase(std::remove_if(keys.begin(), keys.end(), [](const PropertyDecl &property) { return !property.key; }),
               keys.end());
    return keys;
}

bool ClassSchema::isAssociation(const std::string &cls) const {
    const auto chain = chainOf(cls);
    return std::any_of(chain.begin(), chain.end(), [](const ClassDecl *decl) { return decl->association; });
}

bool ClassSchema::isIndication(const std::string &cls) const {
    const auto chain = chainOf(cls);
    return std::any_of(chain.begin(), chain.end(), [](const ClassDecl *decl) { return decl->indication; });
}

}  // namespace tvxbroker

// The classes the broker knows, read from MOF: their hierarchy, the
// Association and Indication qualifiers and the declared properties.
#pragma once

#include <cstddef>
#include <deque>
#include <map>
#include <string>
#include <vector>

#include "cmpi/cmpidt.h"
#include "model/CimValue.h"

namespace tvxbroker {

struct PropertyDecl {
    std::string name;
    CMPIType type = CMPI_null;   // CMPI_ARRAY set for arrays
    std::string referenceClass;  // for CMPI_ref
    bool key = false;            // also set when an ancestor declares the property as key
    CimValue defaultValue;       // null when the MOF gives none
};

struct ClassDecl {
    std::string name;
    std::string superclass;  // empty for a root class
    bool association = false;
    bool indication = false;
    std::vector<PropertyDecl> properties;  // own declarations only, in MOF order
};

class ClassSchema {
public:
    // Both throw std::runtime_error "origin:line: message" on a syntax error,
    // a superclass not declared before, or a class declared twice; nothing of
    // a text that fails is kept. loadFile throws "cannot read <path>" too.
    void loadText(const std::string &text, const std::string &origin);
    void loadFile(const std::string &path);

    // All lookups ignore case; unknown names give null, false or nothing.
    const ClassDecl *find(const std::string &name) const;
    bool isA(const std::string &cls, const std::string &ancestor) const;
    std::vector<std::string> selfAndSubclasses(const std::string &cls) const;  // declaration order
    const PropertyDecl *findProperty(const std::string &cls, const std::string &prop) const;
    std::vector<PropertyDecl> keysOf(const std::string &cls) const;  // base class first
    // Every property, inherited ones included, base class first; each once,
    // as its most derived declaration describes it.
    std::vector<PropertyDecl> propertiesOf(const std::string &cls) const;
    bool isAssociation(const std::string &cls) const;
    bool isIndication(const std::string &cls) const;

private:
    void add(ClassDecl decl, const std::string &origin, int line);
    void removeLast();
    std::vector<const ClassDecl *> chainOf(const std::string &cls) const;  // the class first, then its ancestors

    std::deque<ClassDecl> classes_;                   // declaration order; deque keeps pointers valid
    std::map<std::string, std::size_t> byLowerName_;  // index into classes_
};

}  // namespace tvxbroker

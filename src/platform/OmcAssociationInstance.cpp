#include "platform/OmcAssociationInstance.h"

#include "platform/OmcPropertyNames.h"

namespace OMC {

namespace {

bool hasText(const CmpiString &text) { return !text.isNull() && *text.charPtr() != '\0'; }

// Host, class and keys of `from`, in its namespace or else in `ns`.
CmpiObjectPath copyPath(const CmpiObjectPath &from, const CmpiString &ns) {
    const CmpiString ownNs = from.getNameSpace();
    CmpiObjectPath copy(hasText(ownNs) ? ownNs : ns, from.getClassName().charPtr());
    const CmpiString host = from.getHostname();
    if (hasText(host)) copy.setHostname(host.charPtr());
    for (unsigned int index = 0, count = from.getKeyCount(); index < count; ++index) {
        CmpiString name;
        const CmpiData value = from.getKey(index, &name);
        copy.setKey(name.charPtr(), value);
    }
    return copy;
}

}  // namespace

std::vector<AssociationEnd> associationEnds(const CmpiInstance &association) {
    std::vector<AssociationEnd> ends;
    for (unsigned int index = 0, count = association.getPropertyCount(); index < count; ++index) {
        CmpiString role;
        const CmpiData value = association.getProperty(index, &role);
        if (value.type() == CMPI_ref && !value.isNullValue()) {
            ends.push_back({role, static_cast<CmpiObjectPath>(value)});
        }
    }
    return ends;
}

CmpiObjectPath withNamespace(const CmpiObjectPath &path, const CmpiString &ns) {
    return hasText(path.getNameSpace()) ? path : copyPath(path, ns);
}

CmpiInstance copyAssociation(const CmpiInstance &association, const CmpiString &ns,
                             const char **properties) {
    CmpiObjectPath path = copyPath(association.getObjectPath(), ns);
    for (const AssociationEnd &end : associationEnds(association)) {
        path.setKey(end.role.charPtr(), end.path);
    }
    CmpiInstance copy(path);
    if (properties != nullptr) copy.setPropertyFilter(properties, PropertyNames(nullptr, path).list());
    for (unsigned int index = 0, count = association.getPropertyCount(); index < count; ++index) {
        CmpiString name;
        const CmpiData value = association.getProperty(index, &name);
        copy.setProperty(name.charPtr(), value);
    }
    return copy;
}

}  // namespace OMC

#include "platform/OmcSimpleAssociationMI.h"

#include <algorithm>
#include <optional>
#include <vector>

#include "platform/OmcAssociationCollector.h"
#include "platform/OmcAssociationInstance.h"
#include "platform/OmcFarEnds.h"
#include "platform/OmcObjectIdentity.h"

namespace OMC {

namespace {

struct Filters {
    const char *assocClass;
    const char *resultClass;
    const char *role;
    const char *resultRole;
};

bool given(const char *filter) { return filter != nullptr && *filter != '\0'; }

bool roleMatches(const CmpiString &role, const char *filter) {
    return !given(filter) || role.equalsIgnoreCase(filter);
}

bool classMatches(const CmpiObjectPath &path, const char *filter) {
    return !given(filter) || path.classPathIsA(filter);
}

// The ends of `association` other than the one the source plays, or none
// when the source plays no end (under `role`, when one is given).
std::optional<std::vector<AssociationEnd>> farEnds(const CmpiInstance &association,
                                                   const CmpiObjectPath &source,
                                                   const char *role) {
    std::vector<AssociationEnd> ends = associationEnds(association);
    const auto near = std::find_if(ends.begin(), ends.end(), [&](const AssociationEnd &end) {
        return roleMatches(end.role, role) && sameObject(end.path, source);
    });
    if (near == ends.end()) return std::nullopt;
    ends.erase(near);
    return ends;
}

// Runs doReferences with `filters`, then hands `visit` every association
// that passes the association-class and role filters, with its far ends.
template <class Visit>
CmpiStatus traverse(SimpleAssociationMI &provider, const CmpiContext &ctx, const CmpiObjectPath &source,
                    const Filters &filters, const char **properties, Visit &&visit) {
    AssociationCollector found(source.getNameSpace(), properties);
    const CmpiStatus status = provider.doReferences(ctx, found, source, filters.assocClass,
                                                    filters.resultClass, filters.role,
                                                    filters.resultRole);
    if (status.rc() != CMPI_RC_OK) return status;
    for (const CmpiInstance &association : found.instances()) {
        if (!classMatches(association.getObjectPath(), filters.assocClass)) continue;
        const std::optional<std::vector<AssociationEnd>> far =
            farEnds(association, source, filters.role);
        if (far) visit(association, *far);
    }
    return status;
}

// Hands `visit` the path of every far end that passes the result filters.
template <class Visit>
CmpiStatus traverseToFarEnds(SimpleAssociationMI &provider, const CmpiContext &ctx,
                             const CmpiObjectPath &source, const Filters &filters, Visit &&visit) {
    const CmpiString ns = source.getNameSpace();
    return traverse(provider, ctx, source, filters, nullptr,
                    [&](const CmpiInstance &, const std::vector<AssociationEnd> &ends) {
                        for (const AssociationEnd &end : ends) {
                            if (!roleMatches(end.role, filters.resultRole)) continue;
                            const CmpiObjectPath far = withNamespace(end.path, ns);
                            if (classMatches(far, filters.resultClass)) visit(far);
                        }
                    });
}

// The end of results follows a successful answer, once.
CmpiStatus finish(CmpiResult &rslt, const CmpiStatus &status) {
    if (status.rc() == CMPI_RC_OK) rslt.returnDone();
    return status;
}

}  // namespace

SimpleAssociationMI::SimpleAssociationMI(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), CmpiAssociationMI(mb, ctx) {}

SimpleAssociationMI::~SimpleAssociationMI() = default;

CmpiStatus SimpleAssociationMI::associators(const CmpiContext &ctx, CmpiResult &rslt,
                                            const CmpiObjectPath &op, const char *assocClass,
                                            const char *resultClass, const char *role,
                                            const char *resultRole, const char **properties) {
    std::vector<CmpiObjectPath> farEnds;
    const CmpiStatus status = traverseToFarEnds(*this, ctx, op, {assocClass, resultClass, role, resultRole},
                                                [&](const CmpiObjectPath &far) { farEnds.push_back(far); });
    if (status.rc() == CMPI_RC_OK) {
        for (const CmpiInstance &instance : fetchFarEnds(broker, ctx, farEnds, properties)) rslt.returnData(instance);
    }
    return finish(rslt, status);
}

CmpiStatus SimpleAssociationMI::associatorNames(const CmpiContext &ctx, CmpiResult &rslt,
                                                const CmpiObjectPath &op, const char *assocClass,
                                                const char *resultClass, const char *role,
                                                const char *resultRole) {
    return finish(rslt, traverseToFarEnds(*this, ctx, op, {assocClass, resultClass, role, resultRole},
                                          [&](const CmpiObjectPath &far) { rslt.returnData(far); }));
}

CmpiStatus SimpleAssociationMI::references(const CmpiContext &ctx, CmpiResult &rslt,
                                           const CmpiObjectPath &op, const char *resultClass,
                                           const char *role, const char **properties) {
    return finish(rslt, traverse(*this, ctx, op, {resultClass, nullptr, role, nullptr}, properties,
                                 [&](const CmpiInstance &association, const std::vector<AssociationEnd> &) {
                                     rslt.returnData(association);
                                 }));
}

CmpiStatus SimpleAssociationMI::referenceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                               const CmpiObjectPath &op, const char *resultClass,
                                               const char *role) {
    return finish(rslt, traverse(*this, ctx, op, {resultClass, nullptr, role, nullptr}, nullptr,
                                 [&](const CmpiInstance &association, const std::vector<AssociationEnd> &) {
                                     rslt.returnData(association.getObjectPath());
                                 }));
}

}  // namespace OMC

// The association base of the providers: a derived class says which
// association instances an object takes part in (doReferences), and this
// class answers the broker's four association operations from them.
//
// Every operation collects what doReferences returns first, so a failing
// doReferences leaves the caller with its status alone; on success the end
// of results is signalled once, after the last answer. The filters of a
// request are applied here as well (a provider may ignore those it is
// given): an association counts only when one of its references names the
// source object (compared by sameObject), under the role when a role is
// given, and when its class is or derives from the association class when
// one is given. A null or empty filter text means no filter.
#pragma once

#include "CmpiAssociationMI.h"

namespace OMC {

class SimpleAssociationMI : public CmpiAssociationMI {
public:
    SimpleAssociationMI(const CmpiBroker &broker, const CmpiContext &ctx);
    ~SimpleAssociationMI() override;

    // Returns through `rslt` each association instance that `op` takes
    // part in, each with its references set as properties. The filters
    // are hints the provider may use to answer less; whether it calls
    // returnDone does not matter.
    virtual CmpiStatus doReferences(const CmpiContext &ctx, CmpiResult &rslt,
                                    const CmpiObjectPath &op, const char *assocClass,
                                    const char *resultClass, const char *role,
                                    const char *resultRole) = 0;

    // The objects at the far ends: every reference other than the source's
    // whose role matches `resultRole` and whose class is or derives from
    // `resultClass`, fetched through the broker with the property list by
    // enumerating their classes (fetchFarEnds), never by getInstance. A far
    // end the broker cannot fetch (no such instance, or its provider
    // failing) is left out rather than failing the whole answer.
    CmpiStatus associators(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                           const char *assocClass, const char *resultClass, const char *role,
                           const char *resultRole, const char **properties) override;
    // The paths of those far ends; one without a namespace gets the
    // source's.
    CmpiStatus associatorNames(const CmpiContext &ctx, CmpiResult &rslt,
                               const CmpiObjectPath &op, const char *assocClass,
                               const char *resultClass, const char *role,
                               const char *resultRole) override;
    // The association instances (`resultClass` names the association
    // class), each on a path keyed by its references and limited to the
    // property list, keys and references always kept.
    CmpiStatus references(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                          const char *resultClass, const char *role,
                          const char **properties) override;
    // The paths of those association instances.
    CmpiStatus referenceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                              const char *resultClass, const char *role) override;
};

}  // namespace OMC

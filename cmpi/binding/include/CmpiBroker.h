// The broker as a provider sees it: thread attachment, indication delivery
// and up-calls to other providers. Every failing call throws a CmpiStatus.
#pragma once

#include "CmpiContext.h"
#include "CmpiEnumeration.h"
#include "CmpiInstance.h"

class CmpiBroker {
public:
    CmpiBroker() = default;
    explicit CmpiBroker(const CMPIBroker *handle);

    CmpiContext prepareAttachThread(const CmpiContext &ctx) const;
    void attachThread(const CmpiContext &ctx) const;
    void detachThread(const CmpiContext &ctx) const;
    void deliverIndication(const CmpiContext &ctx, const char *ns,
                           const CmpiInstance &indication) const;

    CmpiEnumeration enumInstanceNames(const CmpiContext &ctx, const CmpiObjectPath &op) const;
    CmpiEnumeration enumInstances(const CmpiContext &ctx, const CmpiObjectPath &op,
                                  const char **properties) const;
    CmpiInstance getInstance(const CmpiContext &ctx, const CmpiObjectPath &op,
                             const char **properties) const;
    CmpiObjectPath createInstance(const CmpiContext &ctx, const CmpiObjectPath &op,
                                  const CmpiInstance &inst) const;
    void setInstance(const CmpiContext &ctx, const CmpiObjectPath &op, const CmpiInstance &inst,
                     const char **properties) const;
    void deleteInstance(const CmpiContext &ctx, const CmpiObjectPath &op) const;
    CmpiEnumeration execQuery(const CmpiContext &ctx, const CmpiObjectPath &op,
                              const char *query, const char *language) const;
    CmpiEnumeration associators(const CmpiContext &ctx, const CmpiObjectPath &op,
                                const char *assocClass, const char *resultClass,
                                const char *role, const char *resultRole,
                                const char **properties) const;
    CmpiEnumeration associatorNames(const CmpiContext &ctx, const CmpiObjectPath &op,
                                    const char *assocClass, const char *resultClass,
                                    const char *role, const char *resultRole) const;
    CmpiEnumeration references(const CmpiContext &ctx, const CmpiObjectPath &op,
                               const char *resultClass, const char *role,
                               const char **properties) const;
    CmpiEnumeration referenceNames(const CmpiContext &ctx, const CmpiObjectPath &op,
                                   const char *resultClass, const char *role) const;

    CMPIBroker *getEnc() const { return mb; }

private:
    CMPIBroker *handle() const;

    CMPIBroker *mb = nullptr;
};

#include "CmpiBroker.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;

CmpiBroker::CmpiBroker(const CMPIBroker *handle) : mb(const_cast<CMPIBroker *>(handle)) {
    cmpibinding::rememberBroker(handle);
}

CMPIBroker *CmpiBroker::handle() const {
    if (mb == nullptr || mb->bft == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_INVALID_HANDLE, "null CMPIBroker");
    }
    return mb;
}

CmpiContext CmpiBroker::prepareAttachThread(const CmpiContext &ctx) const {
    CMPIBroker *h = handle();
    CMPIContext *prepared = h->bft->prepareAttachThread(h, ctx.getEnc());
    if (prepared == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_FAILED, "the broker could not prepare a thread context");
    }
    return CmpiContext(prepared);
}

void CmpiBroker::attachThread(const CmpiContext &ctx) const {
    CMPIBroker *h = handle();
    cmpiCheck(h->bft->attachThread(h, ctx.getEnc()));
}

void CmpiBroker::detachThread(const CmpiContext &ctx) const {
    CMPIBroker *h = handle();
    cmpiCheck(h->bft->detachThread(h, ctx.getEnc()));
}

void CmpiBroker::deliverIndication(const CmpiContext &ctx, const char *ns,
                                   const CmpiInstance &indication) const {
    CMPIBroker *h = handle();
    cmpiCheck(h->bft->deliverIndication(h, ctx.getEnc(), ns, indication.getEnc()));
}

CmpiEnumeration CmpiBroker::enumInstanceNames(const CmpiContext &ctx,
                                              const CmpiObjectPath &op) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(callChecked(h->bft->enumerateInstanceNames, h, ctx.getEnc(), op.getEnc()));
}

CmpiEnumeration CmpiBroker::enumInstances(const CmpiContext &ctx, const CmpiObjectPath &op,
                                          const char **properties) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(
        callChecked(h->bft->enumerateInstances, h, ctx.getEnc(), op.getEnc(), properties));
}

CmpiInstance CmpiBroker::getInstance(const CmpiContext &ctx, const CmpiObjectPath &op,
                                     const char **properties) const {
    CMPIBroker *h = handle();
    return CmpiInstance(callChecked(h->bft->getInstance, h, ctx.getEnc(), op.getEnc(), properties));
}

CmpiObjectPath CmpiBroker::createInstance(const CmpiContext &ctx, const CmpiObjectPath &op,
                                          const CmpiInstance &inst) const {
    CMPIBroker *h = handle();
    return CmpiObjectPath(
        callChecked(h->bft->createInstance, h, ctx.getEnc(), op.getEnc(), inst.getEnc()));
}

void CmpiBroker::setInstance(const CmpiContext &ctx, const CmpiObjectPath &op,
                             const CmpiInstance &inst, const char **properties) const {
    CMPIBroker *h = handle();
    cmpiCheck(h->bft->modifyInstance(h, ctx.getEnc(), op.getEnc(), inst.getEnc(), properties));
}

void CmpiBroker::deleteInstance(const CmpiContext &ctx, const CmpiObjectPath &op) const {
    CMPIBroker *h = handle();
    cmpiCheck(h->bft->deleteInstance(h, ctx.getEnc(), op.getEnc()));
}

CmpiEnumeration CmpiBroker::execQuery(const CmpiContext &ctx, const CmpiObjectPath &op,
                                      const char *query, const char *language) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(
        callChecked(h->bft->execQuery, h, ctx.getEnc(), op.getEnc(), query, language));
}

CmpiEnumeration CmpiBroker::associators(const CmpiContext &ctx, const CmpiObjectPath &op,
                                        const char *assocClass, const char *resultClass,
                                        const char *role, const char *resultRole,
                                        const char **properties) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(callChecked(h->bft->associators, h, ctx.getEnc(), op.getEnc(),
                                       assocClass, resultClass, role, resultRole, properties));
}

CmpiEnumeration CmpiBroker::associatorNames(const CmpiContext &ctx, const CmpiObjectPath &op,
                                            const char *assocClass, const char *resultClass,
                                            const char *role, const char *resultRole) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(callChecked(h->bft->associatorNames, h, ctx.getEnc(), op.getEnc(),
                                       assocClass, resultClass, role, resultRole));
}

CmpiEnumeration CmpiBroker::references(const CmpiContext &ctx, const CmpiObjectPath &op,
                                       const char *resultClass, const char *role,
                                       const char **properties) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(callChecked(h->bft->references, h, ctx.getEnc(), op.getEnc(),
                                       resultClass, role, properties));
}

CmpiEnumeration CmpiBroker::referenceNames(const CmpiContext &ctx, const CmpiObjectPath &op,
                                           const char *resultClass, const char *role) const {
    CMPIBroker *h = handle();
    return CmpiEnumeration(
        callChecked(h->bft->referenceNames, h, ctx.getEnc(), op.getEnc(), resultClass, role));
}

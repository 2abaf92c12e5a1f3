#include "CmpiBaseMI.h"

#include "BindingSupport.h"

CmpiBaseMI::CmpiBaseMI(const CmpiBroker &mbp, const CmpiContext & /*ctx*/) : broker(mbp) {
    cmpibinding::rememberBroker(mbp.getEnc());
}

CmpiBaseMI::~CmpiBaseMI() = default;

CmpiStatus CmpiBaseMI::initialize(const CmpiContext & /*ctx*/) { return CmpiStatus(CMPI_RC_OK); }

CmpiStatus CmpiBaseMI::cleanup(const CmpiContext & /*ctx*/, bool /*terminating*/) {
    return CmpiStatus(CMPI_RC_OK);
}

int CmpiBaseMI::isUnloadable() const { return 1; }

CMPIStatus CmpiBaseMI::cleanupProvider(void *hdl, const CMPIContext *ctx, CMPIBoolean terminating) {
    CmpiBaseMI *provider = static_cast<CmpiBaseMI *>(hdl);
    if (provider == nullptr) return cmpibinding::invalidHandle();
    const bool ending = terminating != 0;
    CMPIStatus status = cmpibinding::runOperation(provider, [&] {
        CmpiContext context(ctx);
        CmpiStatus result = provider->cleanup(context, ending);
        if (result.rc() == CMPI_RC_OK && !ending && !provider->isUnloadable()) {
            result = CmpiStatus(CMPI_RC_DO_NOT_UNLOAD);
        }
        return result;
    });
    if (status.rc != CMPI_RC_OK) return status;
    CmpiProviderBase *base = provider->getProviderBase();
    if (base == nullptr || base->decUseCount() <= 0) {
        if (base != nullptr) base->setBaseMI(nullptr);
        delete provider;
    }
    return status;
}

CMPIStatus CmpiBaseMI::driveBaseCleanup(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                        CMPIBoolean terminating) {
    return cleanupProvider(mi != nullptr ? mi->hdl : nullptr, ctx, terminating);
}

CMPIStatus CmpiBaseMI::driveBaseCleanup(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                        CMPIBoolean terminating) {
    return cleanupProvider(mi != nullptr ? mi->hdl : nullptr, ctx, terminating);
}

CMPIStatus CmpiBaseMI::driveBaseCleanup(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                        CMPIBoolean terminating) {
    return cleanupProvider(mi != nullptr ? mi->hdl : nullptr, ctx, terminating);
}

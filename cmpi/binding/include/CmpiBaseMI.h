// What every provider object is at its root: the broker it was created
// with, its lifecycle operations and the cleanup entry of every function
// table. The interface kinds derive from it virtually, so an object serving
// several kinds has one of these; each kind registers itself here, which
// lets dispatch find it even through private inheritance.
#pragma once

#include "CmpiBroker.h"
#include "CmpiProviderBase.h"
#include "CmpiStatus.h"

class CmpiInstanceMI;
class CmpiAssociationMI;
class CmpiIndicationMI;

class CmpiBaseMI {
public:
    CmpiBaseMI(const CmpiBroker &broker, const CmpiContext &ctx);
    CmpiBaseMI(const CmpiBaseMI &) = delete;
    CmpiBaseMI &operator=(const CmpiBaseMI &) = delete;
    virtual ~CmpiBaseMI();

    virtual CmpiStatus initialize(const CmpiContext &ctx);
    virtual CmpiStatus cleanup(const CmpiContext &ctx, bool terminating);
    virtual int isUnloadable() const;

    // Runs cleanup; when the provider may go, drops this interface's use of
    // it and deletes it once no interface uses it any more.
    static CMPIStatus driveBaseCleanup(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                       CMPIBoolean terminating);
    static CMPIStatus driveBaseCleanup(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                       CMPIBoolean terminating);
    static CMPIStatus driveBaseCleanup(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                       CMPIBoolean terminating);

    void setProviderBase(CmpiProviderBase *base) { providerBase = base; }
    CmpiProviderBase *getProviderBase() const { return providerBase; }
    CmpiBroker *getBroker() { return &broker; }
    const CmpiBroker *getBroker() const { return &broker; }

    CmpiInstanceMI *instanceMI() const { return instanceKind; }
    CmpiAssociationMI *associationMI() const { return associationKind; }
    CmpiIndicationMI *indicationMI() const { return indicationKind; }

protected:
    CmpiBroker broker;

private:
    friend class CmpiInstanceMI;
    friend class CmpiAssociationMI;
    friend class CmpiIndicationMI;

    static CMPIStatus cleanupProvider(void *hdl, const CMPIContext *ctx, CMPIBoolean terminating);

    CmpiProviderBase *providerBase = nullptr;
    CmpiInstanceMI *instanceKind = nullptr;
    CmpiAssociationMI *associationKind = nullptr;
    CmpiIndicationMI *indicationKind = nullptr;
};

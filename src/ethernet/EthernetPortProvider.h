// The host's physical Ethernet ports, their driver and firmware identities
// and the associations between them, rebuilt from the inventory on every
// request.
#pragma once

#include "CmpiInstanceMI.h"
#include "CmpiString.h"
#include "platform/OmcSimpleAssociationMI.h"

namespace EthernetProvider {

class EthernetPortProvider : public CmpiInstanceMI, private OMC::SimpleAssociationMI {
public:
    EthernetPortProvider(const CmpiBroker &mb, const CmpiContext &ctx);
    ~EthernetPortProvider() override;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override;
    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override;
    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override;
    CmpiStatus createInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                              const CmpiInstance &inst) override;
    CmpiStatus setInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const CmpiInstance &inst, const char **properties) override;
    CmpiStatus deleteInstance(const CmpiContext &ctx, CmpiResult &rslt,
                              const CmpiObjectPath &cop) override;

    CmpiStatus doReferences(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                            const char *assocClass, const char *resultClass, const char *role,
                            const char *resultRole) override;

    // The key's text, or a string whose charPtr is null when the key is
    // absent or null.
    static CmpiString getKey(const CmpiObjectPath &op, const char *name);

    // deviceName null: every adapter; otherwise only the first adapter of
    // that name, compared without regard to case.
    CmpiStatus enumInstancesInt(const CmpiContext &ctx, CmpiResult &rslt,
                                const CmpiObjectPath &cop, const char **properties,
                                const char *deviceName);
};

}  // namespace EthernetProvider

// OMC_UnitaryComputerSystem: the one computer system of the host, with the
// keys every product path that names the host carries, so that such a path
// resolves to it.
#pragma once

#include "CmpiInstanceMI.h"

namespace HostProviders {

class ComputerSystemProvider : public CmpiInstanceMI {
public:
    ComputerSystemProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}
    ~ComputerSystemProvider() override = default;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                 const CmpiObjectPath &cop) override;
    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override;
    // Any path but the system's is CMPI_RC_ERR_NOT_FOUND: sfcb's provider
    // process dies of an up-call answered OK without an instance.
    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override;
};

}  // namespace HostProviders

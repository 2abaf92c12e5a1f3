// OMC_UnitaryComputerSystem: the one computer system of the host, with the
// keys every product path that names the host carries, so that such a path
// resolves to it.
#pragma once

#include "frame/ForwardingInstanceProvider.h"

namespace HostProviders {

CmpiStatus enumComputerSystems(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                               const char **properties, CmpiBroker *broker);

// Any path but the system's is CMPI_RC_ERR_NOT_FOUND: sfcb's provider
// process dies of an up-call answered OK without an instance.
CmpiStatus getComputerSystem(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties, CmpiBroker *broker);

using ComputerSystemProvider = frame::ForwardingInstanceProvider<enumComputerSystems, getComputerSystem>;

}  // namespace HostProviders

// The indication provider of Talvex_CIMHeartbeat. Its thread sends whether
// or not the broker has enabled indications, and the broker decides who
// receives them, so every indication operation accepts and changes nothing.
#pragma once

#include "platform/AcceptingIndicationMI.h"

namespace Heartbeat {

class HeartbeatProvider : public platform::AcceptingIndicationMI {
public:
    HeartbeatProvider(const CmpiBroker &mb, const CmpiContext &ctx);
    ~HeartbeatProvider() override;

    // Reads the period and starts the thread, unless it runs or has been
    // stopped; throws CMPI_RC_ERR_FAILED when it cannot be created.
    CmpiStatus initialize(const CmpiContext &ctx) override;
    // Refused with CMPI_RC_NEVER_UNLOAD unless terminating; terminating, it
    // stops the thread for the rest of the process.
    CmpiStatus cleanup(const CmpiContext &ctx, bool terminating) override;
};

}  // namespace Heartbeat

// The Talvex_CIMHeartbeat indication of one heartbeat thread: built once,
// then sent every cycle with the next stamp and the current time.
#pragma once

#include <string>

#include "CmpiBroker.h"
#include "CmpiInstance.h"

namespace Heartbeat {

inline constexpr const char *kHeartbeatNamespace = "root/cimv2";
inline constexpr const char *kHeartbeatClass = "Talvex_CIMHeartbeat";

class HeartbeatIndication {
public:
    HeartbeatIndication();  // reads the host name

    // One cycle: the next stamp and the current time, then delivery in
    // "root/cimv2". Any failure is logged as a failed delivery; a stamp
    // once given is never given again.
    void beat(const CmpiBroker &broker, const CmpiContext &ctx);

private:
    std::string hostname;
    CmpiInstance indication;  // null until the first cycle builds it
    CMPIUint32 counter = 0;
};

}  // namespace Heartbeat

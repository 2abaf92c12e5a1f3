// The Talvex_CIMHeartbeat indication of one heartbeat thread: built once,
// before the first cycle, then sent every cycle with the next stamp and the
// current time.
#pragma once

#include <string>

#include "CmpiBroker.h"
#include "CmpiInstance.h"

namespace Heartbeat {

inline constexpr const char *kHeartbeatNamespace = "root/cimv2";
inline constexpr const char *kHeartbeatClass = "Talvex_CIMHeartbeat";

class HeartbeatIndication {
public:
    // Reads the host name and builds the indication; `threadContext` is the
    // context the thread attached with. Should the broker refuse to build
    // it, the first cycle tries again.
    HeartbeatIndication(const CmpiBroker &broker, const CmpiContext &threadContext);
    HeartbeatIndication(const HeartbeatIndication &) = delete;
    HeartbeatIndication &operator=(const HeartbeatIndication &) = delete;
    ~HeartbeatIndication();

    // One cycle: the next stamp and the current time, then delivery in
    // "root/cimv2". Any failure is logged as a failed delivery; a stamp
    // once given is never given again. What the cycle obtained from the
    // broker is given back before it returns, whatever happened.
    void beat(const CmpiBroker &broker, const CmpiContext &ctx);

private:
    void build();

    std::string hostname;
    // The thread's own copy, which outlives the release at the end of every
    // cycle; null until built.
    CmpiInstance indication;
    CMPIUint32 counter = 0;
};

}  // namespace Heartbeat

// The process-wide state of the heartbeat subsystem: one thread per process,
// started by the provider's initialize and stopped for good by a
// terminating cleanup.
#pragma once

#include <pthread.h>

#include <atomic>
#include <cstdint>

#include "platform/OmcCondition.h"

namespace Heartbeat {

inline constexpr std::int32_t kDefaultHeartbeatSeconds = 300;
inline constexpr std::int32_t kMinimumHeartbeatSeconds = 30;

// Guards the handle, the flags and the thread's loop; the thread holds it
// except while it waits.
extern OMC::Mutex heartbeatMutex;
// The thread waits on it between heartbeats; cleanup broadcasts it.
extern OMC::Condition heartbeatCondition;
extern pthread_t heartbeatThreadHandle;
// Set by a terminating cleanup and never reset.
extern bool heartbeatStop;
// From the thread's creation until it leaves its loop.
extern bool heartbeatRunning;
// Replaced by initialize outside the mutex while a thread may be waiting.
extern std::atomic<std::int32_t> heartbeatIntervalSeconds;

}  // namespace Heartbeat

// The health monitor: every poll enumerates the watched classes through the
// broker, latches each element's worst health and publishes the worst
// health of the poll as the rollup.
#pragma once

#include <array>
#include <cstdint>

#include "CmpiBroker.h"

namespace TvLatchedHealth {

inline constexpr int kHealthPollSeconds = 120;

struct WatchedClass {
    const char *className;
    const char *nameSpace;
};

// Polled in this order.
extern const std::array<WatchedClass, 12> watchedClasses;

// One whole poll, as the thread runs it: the caller holds healthMutex and
// the broker knows `ctx` as an attached thread's context.
void pollWatchedClasses(const CmpiBroker &broker, const CmpiContext &ctx);

// The thread's start routine; `startArgs` is a ThreadStartArgs it owns.
void *HealthMonitorThread(void *startArgs);

}  // namespace TvLatchedHealth

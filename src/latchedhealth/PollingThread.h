// The life both latched-health threads share: attach to the broker, hold
// healthMutex for each cycle and release it only while waiting for the
// next, until a terminating cleanup sets stopThreads.
#pragma once

#include "CmpiBroker.h"

namespace TvLatchedHealth {

using Cycle = void (*)(const CmpiBroker &broker, const CmpiContext &ctx);

// Runs `cycle` at once and then every `seconds`; `startArgs` is the
// ThreadStartArgs the thread owns. Counted in runningThreads while looping.
void runPollingThread(void *startArgs, Cycle cycle, int seconds);

}  // namespace TvLatchedHealth

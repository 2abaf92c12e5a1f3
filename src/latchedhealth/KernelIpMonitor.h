// The kernel IP monitor: every cycle asks the process's change detector to
// compare the interface addresses with the previous cycle's and to deliver
// the changes, which it does only while the broker has indications enabled.
#pragma once

#include "CmpiBroker.h"

namespace TvLatchedHealth {

inline constexpr int kKernelIpCycleSeconds = 30;

// One cycle, as the thread runs it: the caller holds healthMutex. A failure
// is logged and the next cycle runs as usual.
void kernelIpCycle(const CmpiBroker &broker, const CmpiContext &ctx);

// The thread's start routine; `startArgs` is a ThreadStartArgs it owns.
void *KernelIpMonitorThread(void *startArgs);

}  // namespace TvLatchedHealth

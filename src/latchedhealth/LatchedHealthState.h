// The process-wide state of the latched-health subsystem, shared by both
// provider objects, the association provider and the two polling threads.
#pragma once

#include <pthread.h>

#include <atomic>
#include <cstdint>

#include "kernelip/KernelIpIndication.h"
#include "latchedhealth/HealthRecords.h"
#include "platform/OmcCondition.h"

namespace TvLatchedHealth {

// Guards everything below except rollupHealthState and kernelIpIndication.
// Each thread holds it for a whole cycle, so requests wait for a running
// poll to end.
extern OMC::Mutex healthMutex;
// Both threads wait on it between cycles; a terminating cleanup broadcasts it.
extern OMC::Condition healthCondition;
extern HealthRecords healthList;
// The one kernel IP change detector of the process; it has its own lock.
extern TVX::KernelIpIndication kernelIpIndication;

// Set by a terminating cleanup and never reset.
extern bool stopThreads;
// Threads inside their loops.
extern std::int32_t runningThreads;
// Recorded by initialize itself, so that two initializations in quick
// succession never start a second pair; and claimed by the first
// terminating cleanup, the only one that joins.
extern bool threadsStarted;
extern bool threadsClaimed;
extern pthread_t healthThread;
extern pthread_t kernelIpThread;
// Shared by creations and escalations: numbers never repeat.
extern std::uint32_t nextEventId;
// Worst HealthState of the last complete poll; written once per poll by the
// health thread, read without the mutex.
extern std::atomic<std::uint16_t> rollupHealthState;

}  // namespace TvLatchedHealth

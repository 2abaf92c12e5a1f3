#include "latchedhealth/LatchedHealthState.h"

namespace TvLatchedHealth {

// Defined in this order in one file, so they are built in this order when
// the library is loaded and destroyed in the reverse order at unload. The
// factories' base objects are constant initialised and outlive them all.
OMC::Mutex healthMutex;
OMC::Condition healthCondition;
HealthRecords healthList;
TVX::KernelIpIndication kernelIpIndication;

bool stopThreads = false;
std::int32_t runningThreads = 0;
bool threadsStarted = false;
bool threadsClaimed = false;
pthread_t healthThread{};
pthread_t kernelIpThread{};
std::uint32_t nextEventId = 0;
std::atomic<std::uint16_t> rollupHealthState{0};

}  // namespace TvLatchedHealth

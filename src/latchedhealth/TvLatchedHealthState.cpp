#include "latchedhealth/TvLatchedHealthState.h"

#include <syslog.h>

#include <cstdlib>

#include "latchedhealth/HealthInstances.h"
#include "latchedhealth/HealthMonitor.h"
#include "latchedhealth/HealthPaths.h"
#include "latchedhealth/KernelIpMonitor.h"
#include "latchedhealth/LatchedHealthState.h"
#include "platform/ProviderThread.h"

namespace TvLatchedHealth {

namespace {

enum class Served { Latched, Rollup, Other };

Served servedClass(const CmpiObjectPath &path) {
    const CmpiString className = path.getClassName();
    if (className.equalsIgnoreCase(kLatchedHealthClass)) return Served::Latched;
    if (className.equalsIgnoreCase(kRollupHealthClass)) return Served::Rollup;
    return Served::Other;
}

CmpiStatus invalidClass(CMPIrc rc) { return CmpiStatus(rc, "invalid class name"); }

// Both enumerations: every record in list order under the lock, with the end
// of results only after at least one; or the one rollup.
template <class EachRecord, class Rollup>
CmpiStatus enumerate(const CmpiObjectPath &cop, CmpiResult &rslt, EachRecord eachRecord, Rollup rollup) {
    switch (servedClass(cop)) {
    case Served::Latched: {
        const OMC::MutexLock lock(healthMutex);
        for (const auto &record : healthList) eachRecord(*record);
        if (!healthList.empty()) rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
    case Served::Rollup:
        rollup();
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    case Served::Other: break;
    }
    return invalidClass(CMPI_RC_ERR_FAILED);
}

// Without its threads the subsystem would silently report nothing, so a
// thread that cannot be created stops the process.
void startThread(pthread_t &handle, platform::ThreadEntry entry, const CmpiBroker &broker,
                 const CmpiContext &ctx, const char *starter, const char *format) {
    if (platform::startProviderThread(handle, entry, broker, ctx) != 0) {
        syslog(LOG_ERR, format, starter);
        std::abort();
    }
}

}  // namespace

TvLatchedHealthState::TvLatchedHealthState(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), AcceptingIndicationMI(mb, ctx) {}

TvLatchedHealthState::~TvLatchedHealthState() = default;

CmpiStatus TvLatchedHealthState::enumInstanceNames(const CmpiContext &, CmpiResult &rslt,
                                                   const CmpiObjectPath &cop) {
    return enumerate(
        cop, rslt, [&](const HealthInfo &record) { returnHealthName(cop, record, rslt); },
        [&] { returnRollupName(cop, rslt); });
}

CmpiStatus TvLatchedHealthState::enumInstances(const CmpiContext &, CmpiResult &rslt,
                                               const CmpiObjectPath &cop, const char **properties) {
    return enumerate(
        cop, rslt, [&](const HealthInfo &record) { returnHealthInstance(cop, properties, record, rslt); },
        [&] { returnRollupInstance(cop, properties, rslt); });
}

CmpiStatus TvLatchedHealthState::getInstance(const CmpiContext &, CmpiResult &rslt,
                                             const CmpiObjectPath &cop, const char **properties) {
    switch (servedClass(cop)) {
    case Served::Latched: {
        const CmpiStatus notFound(CMPI_RC_ERR_FAILED, "failed to get instances");
        std::uint32_t eventId = 0;
        if (!getEventIdKey(cop, eventId)) return notFound;
        const OMC::MutexLock lock(healthMutex);
        const HealthInfo *record = healthList.findEvent(eventId);
        if (record == nullptr) return notFound;
        returnHealthInstance(cop, properties, *record, rslt);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
    case Served::Rollup:
        returnRollupInstance(cop, properties, rslt);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    case Served::Other: break;
    }
    return invalidClass(CMPI_RC_ERR_NOT_FOUND);
}

CmpiStatus TvLatchedHealthState::initialize(const CmpiContext &ctx) {
    const OMC::MutexLock lock(healthMutex);
    if (threadsStarted) return CmpiStatus(CMPI_RC_OK);
    startThread(healthThread, HealthMonitorThread, broker, ctx, "StartHealthMonitorThread",
                "%s failed to start health monitoring thread\n");
    startThread(kernelIpThread, KernelIpMonitorThread, broker, ctx, "StartKernelIpMonitorThread",
                "%s failed to start Kernel Ip monitoring thread\n");
    threadsStarted = true;
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus TvLatchedHealthState::cleanup(const CmpiContext &, bool terminating) {
    if (!terminating) return CmpiStatus(CMPI_RC_NEVER_UNLOAD);
    // Only the first terminating cleanup joins; a later one finds the
    // threads claimed and returns at once.
    platform::stopProviderThreads(healthMutex, healthCondition, stopThreads,
                                  [] {
                                      const bool join = threadsStarted && !threadsClaimed;
                                      threadsClaimed = true;
                                      return join;
                                  },
                                  {&kernelIpThread, &healthThread});
    return CmpiStatus(CMPI_RC_OK);
}

int TvLatchedHealthState::isUnloadable() const { return 0; }

CmpiStatus TvLatchedHealthState::enableIndications(const CmpiContext &) {
    kernelIpIndication.enableIndication();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus TvLatchedHealthState::disableIndications(const CmpiContext &) {
    kernelIpIndication.disableIndication();
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace TvLatchedHealth

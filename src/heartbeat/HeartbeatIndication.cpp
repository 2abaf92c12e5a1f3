#include "heartbeat/HeartbeatIndication.h"

#include <syslog.h>
#include <unistd.h>

#include <ctime>

#include "CmpiDateTime.h"
#include "platform/ThreadCycleObjects.h"

namespace Heartbeat {
namespace {

std::string hostName() {
    char name[80] = {};
    // The last byte stays the terminator, even for a name cut short.
    gethostname(name, sizeof name - 1);
    return name;
}

}  // namespace

HeartbeatIndication::HeartbeatIndication(const CmpiBroker &broker, const CmpiContext &threadContext)
    : hostname(hostName()) {
    try {
        const platform::ThreadCycleObjects objects(broker, threadContext);
        build();
    } catch (...) {
        // Logged by the first cycle, which builds it again.
    }
}

HeartbeatIndication::~HeartbeatIndication() {
    try {
        if (!indication.isNull()) indication.release();
    } catch (...) {
        // The broker gives no remedy for a copy it cannot free.
    }
}

void HeartbeatIndication::build() {
    CmpiInstance made(CmpiObjectPath(kHeartbeatNamespace, kHeartbeatClass));
    made.setProperty("hostname", hostname.c_str());
    indication = made.clone();
}

void HeartbeatIndication::beat(const CmpiBroker &broker, const CmpiContext &ctx) {
    try {
        const platform::ThreadCycleObjects objects(broker, ctx);
        if (indication.isNull()) build();
        indication.setProperty("stamp", counter++);
        const CMPIUint64 microseconds = static_cast<CMPIUint64>(std::time(nullptr)) * 1000000u;
        indication.setProperty("IndicationTime", CmpiDateTime(microseconds, false));
        broker.deliverIndication(ctx, kHeartbeatNamespace, indication);
    } catch (...) {
        syslog(LOG_ERR, "Failed to deliver indication\n");
    }
}

}  // namespace Heartbeat

#include "heartbeat/HeartbeatIndication.h"

#include <syslog.h>
#include <unistd.h>

#include <ctime>

#include "CmpiDateTime.h"

namespace Heartbeat {
namespace {

std::string hostName() {
    char name[80] = {};
    // The last byte stays the terminator, even for a name cut short.
    gethostname(name, sizeof name - 1);
    return name;
}

}  // namespace

HeartbeatIndication::HeartbeatIndication() : hostname(hostName()) {}

void HeartbeatIndication::beat(const CmpiBroker &broker, const CmpiContext &ctx) {
    try {
        if (indication.isNull()) {
            indication = CmpiInstance(CmpiObjectPath(kHeartbeatNamespace, kHeartbeatClass));
            indication.setProperty("hostname", hostname.c_str());
        }
        indication.setProperty("stamp", counter++);
        const CMPIUint64 microseconds = static_cast<CMPIUint64>(std::time(nullptr)) * 1000000u;
        indication.setProperty("IndicationTime", CmpiDateTime(microseconds, false));
        broker.deliverIndication(ctx, kHeartbeatNamespace, indication);
    } catch (...) {
        syslog(LOG_ERR, "Failed to deliver indication\n");
    }
}

}  // namespace Heartbeat

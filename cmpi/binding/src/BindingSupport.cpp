#include "BindingSupport.h"

#include <atomic>

namespace cmpibinding {

namespace {
std::atomic<const CMPIBroker *> knownBroker{nullptr};
}

const CMPIBroker *currentBroker() { return knownBroker.load(); }

void rememberBroker(const CMPIBroker *broker) {
    if (broker != nullptr) knownBroker.store(broker);
}

const CMPIBroker *requireBroker() {
    const CMPIBroker *broker = currentBroker();
    if (broker == nullptr || broker->eft == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_FAILED, "no broker is known to create CMPI objects");
    }
    return broker;
}

CMPIStatus invalidHandle() { return CMPIStatus{CMPI_RC_ERR_INVALID_HANDLE, nullptr}; }

}  // namespace cmpibinding

namespace cmpibinding {

CmpiData lookedUp(CMPIData data, const CMPIStatus &rc) {
    if (rc.rc == CMPI_RC_ERR_NOT_FOUND || rc.rc == CMPI_RC_ERR_NO_SUCH_PROPERTY) {
        data.type = CMPI_null;
        data.state = CMPI_notFound;
        return CmpiData(data);
    }
    cmpiCheck(rc);
    return CmpiData(data);
}

}  // namespace cmpibinding

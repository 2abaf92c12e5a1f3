#include "CmpiStatus.h"

CmpiStatus::CmpiStatus(CMPIrc rc) : code(rc) {}

CmpiStatus::CmpiStatus(CMPIrc rc, const char *msg)
    : code(rc), hasMessage(msg != nullptr), message(msg != nullptr ? msg : "") {}

CmpiStatus::CmpiStatus(const CMPIStatus &status) : code(status.rc) {
    if (status.msg != nullptr && status.msg->ft != nullptr) {
        const char *text = status.msg->ft->getCharPtr(status.msg, nullptr);
        if (text != nullptr) {
            hasMessage = true;
            message = text;
        }
    }
}

CMPIStatus CmpiStatus::toCMPIStatus(const CMPIBroker *broker) const {
    CMPIStatus status{code, nullptr};
    if (hasMessage && broker != nullptr && broker->eft != nullptr) {
        status.msg = broker->eft->newString(broker, message.c_str(), nullptr);
    }
    return status;
}

void cmpiCheck(const CMPIStatus &status) {
    if (status.rc != CMPI_RC_OK) throw CmpiStatus(status);
}

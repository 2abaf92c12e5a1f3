#include "CmpiDateTime.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;
using cmpibinding::requireBroker;

CmpiDateTime::CmpiDateTime() {
    const CMPIBroker *broker = requireBroker();
    dt = callChecked(broker->eft->newDateTime, broker);
}

CmpiDateTime::CmpiDateTime(CMPIUint64 microseconds, bool interval) {
    const CMPIBroker *broker = requireBroker();
    dt = callChecked(broker->eft->newDateTimeFromBinary, broker, microseconds,
                     CMPIBoolean(interval ? 1 : 0));
}

CmpiDateTime::CmpiDateTime(const char *cimText) {
    const CMPIBroker *broker = requireBroker();
    dt = callChecked(broker->eft->newDateTimeFromChars, broker, cimText);
}

CMPIDateTime *CmpiDateTime::handle() const {
    return cmpibinding::requireHandle(dt, "null CMPIDateTime");
}

CMPIUint64 CmpiDateTime::getDateTime() const {
    CMPIDateTime *h = handle();
    return callChecked(h->ft->getBinaryFormat, h);
}

bool CmpiDateTime::isInterval() const {
    CMPIDateTime *h = handle();
    return callChecked(h->ft->isInterval, h) != 0;
}

CmpiString CmpiDateTime::toString() const {
    CMPIDateTime *h = handle();
    return CmpiString(callChecked(h->ft->getStringFormat, h));
}

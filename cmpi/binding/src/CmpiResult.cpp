#include "CmpiResult.h"

#include "BindingSupport.h"

CMPIResult *CmpiResult::handle() const { return cmpibinding::requireHandle(rslt, "null CMPIResult"); }

void CmpiResult::returnData(const CmpiInstance &instance) {
    CMPIResult *h = handle();
    cmpiCheck(h->ft->returnInstance(h, instance.getEnc()));
}

void CmpiResult::returnData(const CmpiObjectPath &path) {
    CMPIResult *h = handle();
    cmpiCheck(h->ft->returnObjectPath(h, path.getEnc()));
}

void CmpiResult::returnData(const CmpiData &value) {
    CMPIResult *h = handle();
    cmpiCheck(h->ft->returnData(h, value.value(), value.type()));
}

void CmpiResult::returnDone() {
    CMPIResult *h = handle();
    cmpiCheck(h->ft->returnDone(h));
}

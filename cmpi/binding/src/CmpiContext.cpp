#include "CmpiContext.h"

#include "BindingSupport.h"

using cmpibinding::requireHandle;

CmpiData CmpiContext::getEntry(const char *name) const {
    CMPIContext *handle = requireHandle(ctx, "null CMPIContext");
    CMPIStatus rc = cmpibinding::okStatus();
    CMPIData data = handle->ft->getEntry(handle, name, &rc);
    return cmpibinding::lookedUp(data, rc);
}

void CmpiContext::addEntry(const char *name, const CmpiData &value) const {
    CMPIContext *handle = requireHandle(ctx, "null CMPIContext");
    cmpiCheck(handle->ft->addEntry(handle, name, value.value(), value.type()));
}

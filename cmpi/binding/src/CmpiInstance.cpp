#include "CmpiInstance.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;

CmpiInstance::CmpiInstance(const CmpiObjectPath &path) {
    const CMPIBroker *broker = cmpibinding::requireBroker();
    inst = callChecked(broker->eft->newInstance, broker, path.getEnc());
}

CMPIInstance *CmpiInstance::handle() const {
    return cmpibinding::requireHandle(inst, "null CMPIInstance");
}

CmpiData CmpiInstance::getProperty(const char *name) const {
    CMPIInstance *h = handle();
    CMPIStatus rc = cmpibinding::okStatus();
    CMPIData data = h->ft->getProperty(h, name, &rc);
    return cmpibinding::lookedUp(data, rc);
}

CmpiData CmpiInstance::getProperty(unsigned int index, CmpiString *name) const {
    CMPIInstance *h = handle();
    CMPIString *propertyName = nullptr;
    CMPIData data = callChecked(h->ft->getPropertyAt, h, index, &propertyName);
    if (name != nullptr) *name = CmpiString(propertyName);
    return CmpiData(data);
}

unsigned int CmpiInstance::getPropertyCount() const {
    CMPIInstance *h = handle();
    return callChecked(h->ft->getPropertyCount, h);
}

void CmpiInstance::setProperty(const char *name, const CmpiData &value) {
    CMPIInstance *h = handle();
    cmpiCheck(h->ft->setProperty(h, name, value.value(), value.type()));
}

CmpiObjectPath CmpiInstance::getObjectPath() const {
    CMPIInstance *h = handle();
    return CmpiObjectPath(callChecked(h->ft->getObjectPath, h));
}

void CmpiInstance::setObjectPath(const CmpiObjectPath &path) {
    CMPIInstance *h = handle();
    cmpiCheck(h->ft->setObjectPath(h, path.getEnc()));
}

void CmpiInstance::setPropertyFilter(const char **properties, const char **keys) {
    CMPIInstance *h = handle();
    cmpiCheck(h->ft->setPropertyFilter(h, properties, keys));
}

CmpiInstance CmpiInstance::clone() const {
    CMPIInstance *h = handle();
    return CmpiInstance(callChecked(h->ft->clone, h));
}

void CmpiInstance::release() {
    CMPIInstance *h = handle();
    inst = nullptr;
    cmpiCheck(h->ft->release(h));
}

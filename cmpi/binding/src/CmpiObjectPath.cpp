#include "CmpiObjectPath.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;
using cmpibinding::requireBroker;

CmpiObjectPath::CmpiObjectPath(const char *ns, const char *className) {
    const CMPIBroker *broker = requireBroker();
    op = callChecked(broker->eft->newObjectPath, broker, ns, className);
}

CmpiObjectPath::CmpiObjectPath(const CmpiString &ns, const char *className)
    : CmpiObjectPath(ns.charPtr(), className) {}

CMPIObjectPath *CmpiObjectPath::handle() const {
    return cmpibinding::requireHandle(op, "null CMPIObjectPath");
}

CmpiString CmpiObjectPath::getNameSpace() const {
    CMPIObjectPath *h = handle();
    return CmpiString(callChecked(h->ft->getNameSpace, h));
}

void CmpiObjectPath::setNameSpace(const char *ns) {
    CMPIObjectPath *h = handle();
    cmpiCheck(h->ft->setNameSpace(h, ns));
}

CmpiString CmpiObjectPath::getHostname() const {
    CMPIObjectPath *h = handle();
    return CmpiString(callChecked(h->ft->getHostname, h));
}

void CmpiObjectPath::setHostname(const char *host) {
    CMPIObjectPath *h = handle();
    cmpiCheck(h->ft->setHostname(h, host));
}

CmpiString CmpiObjectPath::getClassName() const {
    CMPIObjectPath *h = handle();
    return CmpiString(callChecked(h->ft->getClassName, h));
}

void CmpiObjectPath::setClassName(const char *className) {
    CMPIObjectPath *h = handle();
    cmpiCheck(h->ft->setClassName(h, className));
}

CmpiData CmpiObjectPath::getKey(const char *name) const {
    CMPIObjectPath *h = handle();
    CMPIStatus rc = cmpibinding::okStatus();
    CMPIData data = h->ft->getKey(h, name, &rc);
    return cmpibinding::lookedUp(data, rc);
}

CmpiData CmpiObjectPath::getKey(unsigned int index, CmpiString *name) const {
    CMPIObjectPath *h = handle();
    CMPIString *keyName = nullptr;
    CMPIData data = callChecked(h->ft->getKeyAt, h, index, &keyName);
    if (name != nullptr) *name = CmpiString(keyName);
    return CmpiData(data);
}

unsigned int CmpiObjectPath::getKeyCount() const {
    CMPIObjectPath *h = handle();
    return callChecked(h->ft->getKeyCount, h);
}

void CmpiObjectPath::setKey(const char *name, const CmpiData &value) {
    CMPIObjectPath *h = handle();
    cmpiCheck(h->ft->addKey(h, name, value.value(), value.type()));
}

bool CmpiObjectPath::classPathIsA(const char *className) const {
    CMPIObjectPath *h = handle();
    const CMPIBroker *broker = requireBroker();
    return callChecked(broker->eft->classPathIsA, broker, h, className) != 0;
}

CmpiString CmpiObjectPath::toString() const {
    CMPIObjectPath *h = handle();
    return CmpiString(callChecked(h->ft->toString, h));
}

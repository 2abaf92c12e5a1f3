#include "CmpiArray.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;

CmpiArrayIdx &CmpiArrayIdx::operator=(const CmpiData &value) {
    array.setElementAt(index, value);
    return *this;
}

CmpiArrayIdx::operator CmpiData() const { return array.getElementAt(index); }

CmpiArray::CmpiArray(unsigned int size, CMPIType elementType) {
    const CMPIBroker *broker = cmpibinding::requireBroker();
    arr = callChecked(broker->eft->newArray, broker, size, elementType);
}

CMPIArray *CmpiArray::handle() const { return cmpibinding::requireHandle(arr, "null CMPIArray"); }

unsigned int CmpiArray::size() const {
    CMPIArray *h = handle();
    return callChecked(h->ft->getSize, h);
}

CMPIType CmpiArray::getSimpleType() const {
    CMPIArray *h = handle();
    return callChecked(h->ft->getSimpleType, h);
}

CmpiData CmpiArray::getElementAt(unsigned int index) const {
    CMPIArray *h = handle();
    return CmpiData(callChecked(h->ft->getElementAt, h, index));
}

void CmpiArray::setElementAt(unsigned int index, const CmpiData &value) const {
    CMPIArray *h = handle();
    cmpiCheck(h->ft->setElementAt(h, index, value.value(), value.type()));
}

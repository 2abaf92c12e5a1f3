#include "CmpiEnumeration.h"

#include "BindingSupport.h"

using cmpibinding::callChecked;

CMPIEnumeration *CmpiEnumeration::handle() const {
    return cmpibinding::requireHandle(en, "null CMPIEnumeration");
}

bool CmpiEnumeration::hasNext() const {
    CMPIEnumeration *h = handle();
    return callChecked(h->ft->hasNext, h) != 0;
}

CmpiData CmpiEnumeration::getNext() const {
    CMPIEnumeration *h = handle();
    return CmpiData(callChecked(h->ft->getNext, h));
}

CmpiArray CmpiEnumeration::toArray() const {
    CMPIEnumeration *h = handle();
    return CmpiArray(callChecked(h->ft->toArray, h));
}

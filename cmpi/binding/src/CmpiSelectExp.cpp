#include "CmpiSelectExp.h"

#include "BindingSupport.h"

CmpiString CmpiSelectExp::getString() const {
    CMPISelectExp *h = cmpibinding::requireHandle(se, "null CMPISelectExp");
    return CmpiString(cmpibinding::callChecked(h->ft->getString, h));
}

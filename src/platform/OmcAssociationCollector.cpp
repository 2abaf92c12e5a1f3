#include "platform/OmcAssociationCollector.h"

#include "CmpiStatus.h"
#include "platform/OmcAssociationInstance.h"

namespace OMC {

namespace {

[[noreturn]] void rejectNonInstance() {
    throw CmpiStatus(CMPI_RC_ERR_FAILED,
                     "doReferences returned something other than an association instance");
}

}  // namespace

AssociationCollector::AssociationCollector(const CmpiString &nameSpace, const char **propertyList)
    : CmpiResult(nullptr), ns(nameSpace), properties(propertyList) {}

void AssociationCollector::returnData(const CmpiInstance &instance) {
    collected.push_back(copyAssociation(instance, ns, properties));
}

void AssociationCollector::returnData(const CmpiObjectPath &) { rejectNonInstance(); }

void AssociationCollector::returnData(const CmpiData &) { rejectNonInstance(); }

}  // namespace OMC

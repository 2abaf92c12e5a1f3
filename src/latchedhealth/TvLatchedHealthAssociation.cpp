#include "latchedhealth/TvLatchedHealthAssociation.h"

#include "CmpiInstance.h"
#include "latchedhealth/HealthInstances.h"
#include "latchedhealth/HealthPaths.h"
#include "latchedhealth/LatchedHealthState.h"

namespace TvLatchedHealth {

TvLatchedHealthAssociation::TvLatchedHealthAssociation(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), SimpleAssociationMI(mb, ctx) {}

TvLatchedHealthAssociation::~TvLatchedHealthAssociation() = default;

CmpiStatus TvLatchedHealthAssociation::doReferences(const CmpiContext &, CmpiResult &rslt,
                                                    const CmpiObjectPath &op, const char *,
                                                    const char *, const char *, const char *) {
    const CmpiString nameSpace = op.getNameSpace();
    CmpiInstance association(CmpiObjectPath(nameSpace, "Talvex_LatchedHealthAssociation"));
    if (!op.getClassName().equalsIgnoreCase(kLatchedHealthClass)) return CmpiStatus(CMPI_RC_OK);
    std::uint32_t eventId = 0;
    if (!getEventIdKey(op, eventId)) return CmpiStatus(CMPI_RC_ERR_FAILED, "Invalid event id");
    association.setProperty("Antecedent", CmpiData(op));

    const CmpiStatus notFound(CMPI_RC_ERR_NOT_FOUND, "Requested event id not found");
    const OMC::MutexLock lock(healthMutex);
    const HealthInfo *record = healthList.findEvent(eventId);
    if (record == nullptr) return notFound;
    CmpiObjectPath element(record->nameSpace, record->className);
    if (!setPathFromHealthInfo(*record, element)) return notFound;
    association.setProperty("Dependent", CmpiData(element));
    rslt.returnData(association);
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

int TvLatchedHealthAssociation::isUnloadable() const { return 0; }

}  // namespace TvLatchedHealth

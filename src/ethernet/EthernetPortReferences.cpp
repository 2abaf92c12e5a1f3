// Association traversal works from the paths alone: it neither takes the
// inventory nor checks that the adapter exists.
#include "ethernet/EthernetPortObjects.h"
#include "ethernet/EthernetPortProvider.h"
#include "frame/ReferenceFilters.h"

namespace EthernetProvider {

using frame::classFilterAccepts;
using frame::roleFilterMisses;

CmpiStatus EthernetPortProvider::doReferences(const CmpiContext &ctx, CmpiResult &rslt,
                                              const CmpiObjectPath &op, const char *assocClass,
                                              const char *resultClass, const char *role,
                                              const char *resultRole) {
    const CmpiString className = op.getClassName();
    const CmpiString ns = op.getNameSpace();

    if (className.equalsIgnoreCase(portClass)) {
        if (roleFilterMisses(role, "Dependent") || roleFilterMisses(resultRole, "Antecedent")) {
            return CmpiStatus(CMPI_RC_OK);
        }
        const bool wantDriver = classFilterAccepts(ns, driverIdentityClass, resultClass) &&
                                classFilterAccepts(ns, driverElementClass, assocClass);
        const bool wantFirmware = classFilterAccepts(ns, firmwareIdentityClass, resultClass) &&
                                  classFilterAccepts(ns, firmwareElementClass, assocClass);
        const CmpiString deviceId = getKey(op, "DeviceID");
        if (deviceId.isNull()) {
            return deviceIdNotValid();
        }
        for (const IdentityKind *kind : {&driverIdentity, &firmwareIdentity}) {
            if (!(kind == &driverIdentity ? wantDriver : wantFirmware)) continue;
            rslt.returnData(buildElementInstance(
                *kind, ns, op, buildIdentityPath(*kind, ns, deviceId.charPtr()), false));
        }
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    for (const IdentityKind *kind : {&driverIdentity, &firmwareIdentity}) {
        if (!className.equalsIgnoreCase(kind->identityClass)) continue;
        if (roleFilterMisses(role, "Antecedent") || roleFilterMisses(resultRole, "Dependent") ||
            !classFilterAccepts(ns, portClass, resultClass)) {
            return CmpiStatus(CMPI_RC_OK);
        }
        const CmpiString instanceId = getKey(op, "InstanceID");
        if (instanceId.isNull()) {
            return deviceIdNotValid();
        }
        const std::string deviceId = deviceIdFromInstanceId(instanceId.charPtr());
        const CmpiObjectPath port = buildPortPath(ctx, getBroker(), ns, deviceId.c_str());
        rslt.returnData(buildElementInstance(*kind, ns, port, op, false));
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace EthernetProvider

// Association traversal works from the paths alone: it neither takes the
// inventory nor checks that the adapter exists.
#include <strings.h>

#include "ethernet/EthernetPortObjects.h"
#include "ethernet/EthernetPortProvider.h"

namespace EthernetProvider {
namespace {

bool given(const char *filter) { return filter != nullptr && *filter != '\0'; }

bool filterMisses(const char *filter, const char *expected) {
    return given(filter) && ::strcasecmp(filter, expected) != 0;
}

bool classIsA(const CmpiString &ns, const char *className, const char *filter) {
    return !given(filter) || CmpiObjectPath(ns, className).classPathIsA(filter);
}

}  // namespace

CmpiStatus EthernetPortProvider::doReferences(const CmpiContext &ctx, CmpiResult &rslt,
                                              const CmpiObjectPath &op, const char *assocClass,
                                              const char *resultClass, const char *role,
                                              const char *resultRole) {
    const CmpiString className = op.getClassName();
    const CmpiString ns = op.getNameSpace();

    if (className.equalsIgnoreCase(portClass)) {
        if (filterMisses(role, "Dependent") || filterMisses(resultRole, "Antecedent")) {
            return CmpiStatus(CMPI_RC_OK);
        }
        const bool wantDriver = classIsA(ns, driverIdentityClass, resultClass) &&
                                classIsA(ns, driverElementClass, assocClass);
        const bool wantFirmware = classIsA(ns, firmwareIdentityClass, resultClass) &&
                                  classIsA(ns, firmwareElementClass, assocClass);
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
        if (filterMisses(role, "Antecedent") || filterMisses(resultRole, "Dependent") ||
            !classIsA(ns, portClass, resultClass)) {
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

#include "ethernet/EthernetPortProvider.h"

#include <strings.h>

#include <vector>

#include "ethernet/EthernetPortObjects.h"
#include "ethernet/GetPnicDetails.h"

namespace EthernetProvider {
namespace {

// In the order requests are matched against them.
enum class ServedClass { port, driverIdentity, firmwareIdentity, driverElement, firmwareElement };

bool matchServedClass(const CmpiString &className, ServedClass &served) {
    const struct {
        const char *name;
        ServedClass served = ServedClass::port;
    } classes[] = {
        {portClass, ServedClass::port},
        {driverIdentityClass, ServedClass::driverIdentity},
        {firmwareIdentityClass, ServedClass::firmwareIdentity},
        {driverElementClass, ServedClass::driverElement},
        {firmwareElementClass, ServedClass::firmwareElement},
    };
    for (const auto &entry : classes) {
        if (className.equalsIgnoreCase(entry.name)) {
            served = entry.served;
            return true;
        }
    }
    return false;
}

const IdentityKind &identityOf(ServedClass served) {
    return served == ServedClass::driverIdentity || served == ServedClass::driverElement
               ? driverIdentity
               : firmwareIdentity;
}

// Every enumeration takes the inventory, then checks the class, then hands
// `visit` each adapter with the class served; `visit` returns false to end
// the walk early.
template <class Visit>
CmpiStatus walkAdapters(const CmpiObjectPath &cop, CmpiResult &rslt, Visit &&visit) {
    std::vector<PnicDetails> pnics;
    if (getPnicDetails(pnics) != 0) {
        return CmpiStatus(CMPI_RC_ERR_FAILED, "Failed to get pnics information");
    }
    if (!pnics.empty()) {
        ServedClass served = ServedClass::port;
        if (!matchServedClass(cop.getClassName(), served)) {
            return CmpiStatus(CMPI_RC_ERR_INVALID_CLASS);
        }
        for (const PnicDetails &pnic : pnics) {
            if (!visit(pnic, served)) break;
        }
    }
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace

EthernetPortProvider::EthernetPortProvider(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), OMC::SimpleAssociationMI(mb, ctx) {}

EthernetPortProvider::~EthernetPortProvider() = default;

CmpiString EthernetPortProvider::getKey(const CmpiObjectPath &op, const char *name) {
    const CmpiData key = op.getKey(name);
    if (key.isNotFound() || key.isNullValue()) return CmpiString();
    return key;
}

CmpiStatus EthernetPortProvider::enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt,
                                                   const CmpiObjectPath &cop) {
    const CmpiString ns = cop.getNameSpace();
    return walkAdapters(cop, rslt, [&](const PnicDetails &pnic, ServedClass served) {
        if (served == ServedClass::port) {
            rslt.returnData(buildPortPath(ctx, getBroker(), ns, pnic.name));
            return true;
        }
        const IdentityKind &kind = identityOf(served);
        const CmpiObjectPath identity = buildIdentityPath(kind, ns, pnic.name);
        if (served == ServedClass::driverIdentity || served == ServedClass::firmwareIdentity) {
            rslt.returnData(identity);
        } else {
            const CmpiObjectPath port = buildPortPath(ctx, getBroker(), ns, pnic.name);
            rslt.returnData(buildElementPath(kind, ns, port, identity));
        }
        return true;
    });
}

CmpiStatus EthernetPortProvider::enumInstances(const CmpiContext &ctx, CmpiResult &rslt,
                                               const CmpiObjectPath &cop,
                                               const char **properties) {
    return enumInstancesInt(ctx, rslt, cop, properties, nullptr);
}

CmpiStatus EthernetPortProvider::enumInstancesInt(const CmpiContext &ctx, CmpiResult &rslt,
                                                  const CmpiObjectPath &cop,
                                                  const char **properties,
                                                  const char *deviceName) {
    const CmpiString ns = cop.getNameSpace();
    return walkAdapters(cop, rslt, [&](const PnicDetails &pnic, ServedClass served) {
        if (deviceName != nullptr && ::strcasecmp(pnic.name, deviceName) != 0) return true;
        if (served == ServedClass::port) {
            rslt.returnData(buildPortInstance(ctx, getBroker(), ns, pnic, properties));
        } else if (served == ServedClass::driverIdentity ||
                   served == ServedClass::firmwareIdentity) {
            rslt.returnData(buildIdentityInstance(identityOf(served), ns, pnic));
        } else {
            const IdentityKind &kind = identityOf(served);
            rslt.returnData(buildElementInstance(kind, ns,
                                                 buildPortPath(ctx, getBroker(), ns, pnic.name),
                                                 buildIdentityPath(kind, ns, pnic.name), true));
        }
        return deviceName == nullptr;
    });
}

CmpiStatus EthernetPortProvider::getInstance(const CmpiContext &ctx, CmpiResult &rslt,
                                             const CmpiObjectPath &cop, const char **properties) {
    ServedClass served;
    if (!matchServedClass(cop.getClassName(), served)) {
        return CmpiStatus(CMPI_RC_ERR_NOT_FOUND, "DeviceID specified is not valid");
    }
    switch (served) {
        case ServedClass::port: {
            const CmpiString deviceId = getKey(cop, "DeviceID");
            if (deviceId.isNull()) {
                return CmpiStatus(CMPI_RC_ERR_NOT_FOUND, "Specified DeviceID is not found");
            }
            return enumInstancesInt(ctx, rslt, cop, properties, deviceId.charPtr());
        }
        case ServedClass::driverIdentity:
        case ServedClass::firmwareIdentity: {
            const CmpiString instanceId = getKey(cop, "InstanceID");
            if (instanceId.isNull()) return deviceIdNotValid();
            const std::string deviceId = deviceIdFromInstanceId(instanceId.charPtr());
            return enumInstancesInt(ctx, rslt, cop, properties, deviceId.c_str());
        }
        case ServedClass::driverElement:
        case ServedClass::firmwareElement: {
            const CmpiObjectPath dependent = cop.getKey("Dependent");
            const CmpiString deviceId = getKey(dependent, "DeviceID");
            if (deviceId.isNull()) return deviceIdNotValid();
            return enumInstancesInt(ctx, rslt, cop, properties, deviceId.charPtr());
        }
    }
    return deviceIdNotValid();
}

CmpiStatus EthernetPortProvider::createInstance(const CmpiContext &, CmpiResult &,
                                                const CmpiObjectPath &, const CmpiInstance &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus EthernetPortProvider::setInstance(const CmpiContext &, CmpiResult &,
                                             const CmpiObjectPath &, const CmpiInstance &,
                                             const char **) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

CmpiStatus EthernetPortProvider::deleteInstance(const CmpiContext &, CmpiResult &,
                                                const CmpiObjectPath &) {
    return CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

}  // namespace EthernetProvider

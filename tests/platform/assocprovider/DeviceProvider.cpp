// A fixed system and devices served as instances, and the associations
// between them on OMC::SimpleAssociationMI. Like the product's providers it
// answers associations from paths alone and reuses one instance per
// association class for all its answers; unlike them it ignores every filter,
// so the tests see the filtering the base does. Every reference is rebuilt
// without a namespace, not copied from the request, so the base must
// recognise the source end. System alpha and the devices listed exist; a
// link may name one that does not.
#include <string>

#include "CmpiInstanceMI.h"
#include "CmpiProviderFactory.h"
#include "platform/OmcSimpleAssociationMI.h"

namespace {

struct Device {
    const char *className;
    const char *name;
};

constexpr Device kDevices[] = {{"Test_Disk", "disk0"}, {"Test_Device", "nic0"}, {"Test_Disk", "disk1"}};

struct Link {
    const char *assocClass;
    const char *system;
    const char *deviceClass;
    const char *device;
};

constexpr Link kLinks[] = {
    {"Test_HostedDevice", "alpha", "Test_Disk", "disk0"},
    {"Test_HostedDevice", "alpha", "Test_Device", "nic0"},
    {"Test_HostedDevice", "alpha", "Test_Disk", "ghost"},  // a device that does not exist
    {"Test_SpareDevice", "alpha", "Test_Disk", "disk1"},
    {"Test_HostedDevice", "broken", "Test_Disk", "disk9"},
};

// Asking for the associations of the broken system fails.
constexpr const char *kBrokenSystem = "broken";

CmpiObjectPath keyedPath(const char *className, const char *key, const std::string &value) {
    CmpiObjectPath path(nullptr, className);
    path.setKey(key, value.c_str());
    return path;
}

const char *keyOf(const CmpiObjectPath &path) { return path.classPathIsA("Test_System") ? "Name" : "DeviceID"; }

CmpiInstance instanceOf(const CmpiObjectPath &classPath, const std::string &name, const char **properties) {
    const char *key = keyOf(classPath);
    CmpiObjectPath path(classPath.getNameSpace(), classPath.getClassName().charPtr());
    path.setKey(key, name.c_str());
    CmpiInstance instance(path);
    const char *keys[] = {key, nullptr};
    instance.setPropertyFilter(properties, keys);
    instance.setProperty(key, name.c_str());
    if (!classPath.classPathIsA("Test_System")) {
        instance.setProperty("Model", "Kestrel");
        instance.setProperty("Size", CMPIUint32(500));
    }
    return instance;
}

class DeviceProvider : public CmpiInstanceMI, public OMC::SimpleAssociationMI {
public:
    DeviceProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), SimpleAssociationMI(mb, ctx) {}

    // The broker asks once per registered class, naming it in `cop`.
    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        const CmpiString className = cop.getClassName();
        if (className.equalsIgnoreCase("Test_System")) rslt.returnData(instanceOf(cop, "alpha", properties));
        for (const Device &device : kDevices) {
            if (className.equalsIgnoreCase(device.className)) rslt.returnData(instanceOf(cop, device.name, properties));
        }
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus doReferences(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &op, const char *,
                            const char *, const char *, const char *) override {
        const bool fromSystem = op.classPathIsA("Test_System");
        if (!fromSystem && !op.classPathIsA("Test_Device")) return CmpiStatus(CMPI_RC_OK);
        const std::string name = static_cast<const char *>(op.getKey(keyOf(op)));
        const CmpiString ns = op.getNameSpace();
        CmpiInstance hosted(CmpiObjectPath(ns, "Test_HostedDevice"));
        CmpiInstance spare(CmpiObjectPath(ns, "Test_SpareDevice"));
        for (const Link &link : kLinks) {
            if (name != (fromSystem ? link.system : link.device)) continue;
            CmpiInstance &association = std::string(link.assocClass) == "Test_SpareDevice" ? spare : hosted;
            association.setProperty("Antecedent", keyedPath("Test_System", "Name", link.system));
            association.setProperty("Dependent", keyedPath(link.deviceClass, "DeviceID", link.device));
            association.setProperty("Note", link.device);
            rslt.returnData(association);
        }
        // Ending the results is the base's job; a provider that does it too must not end them early.
        rslt.returnDone();
        if (fromSystem && name == kBrokenSystem) return CmpiStatus(CMPI_RC_ERR_FAILED, "broken system");
        return CmpiStatus(CMPI_RC_OK);
    }
};

}  // namespace

CMProviderBase(OmcTestDevices);
CMInstanceMIFactory(DeviceProvider, OmcTestDevices)
CMAssociationMIFactory(DeviceProvider, OmcTestDevices)

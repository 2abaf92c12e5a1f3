// Serves getInstance of the systems and devices, so that associators have
// far ends to fetch; an unknown name is not found.
#include "CmpiInstanceMI.h"
#include "CmpiProviderFactory.h"
#include "TestInventory.h"

namespace {

using namespace omctest;

// An instance on `path`, moved to the request's namespace, holding its one
// key and whatever of the property list it is given.
CmpiInstance instanceOn(CmpiObjectPath path, const CmpiObjectPath &request, const char *key,
                        const char **properties) {
    path.setNameSpace(request.getNameSpace().charPtr());
    CmpiInstance instance(path);
    const char *keys[] = {key, nullptr};
    instance.setPropertyFilter(properties, keys);
    instance.setProperty(key, path.getKey(key));
    return instance;
}

class InventoryProvider : public CmpiInstanceMI {
public:
    InventoryProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx) {}

    CmpiStatus getInstance(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        const bool isSystem = cop.classPathIsA("Test_System");
        const std::string name = stringKey(cop, isSystem ? "Name" : "DeviceID");
        CmpiInstance found;
        for (const char *system : kSystems) {
            if (!isSystem || name != system) continue;
            found = instanceOn(systemPath(system), cop, "Name", properties);
            found.setProperty("Location", "rack 1");
        }
        for (const Device &device : kDevices) {
            if (isSystem || name != device.id) continue;
            found = instanceOn(devicePath(device.className, device.id), cop, "DeviceID", properties);
            found.setProperty("Model", device.model);
            found.setProperty("Size", device.size);
        }
        if (found.isNull()) return CmpiStatus(CMPI_RC_ERR_NOT_FOUND, name.c_str());
        rslt.returnData(found);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
};

}  // namespace

CMProviderBase(OmcTestInventory);
CMInstanceMIFactory(InventoryProvider, OmcTestInventory)

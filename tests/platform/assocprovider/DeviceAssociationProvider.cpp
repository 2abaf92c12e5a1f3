// The system-device associations, on OMC::SimpleAssociationMI. Like the
// product's providers it answers from paths alone, reuses one instance per
// association class for all its answers and leaves the end of results to
// the base; unlike them it ignores every filter, so the tests see the
// filtering the base does. Every reference is rebuilt from the tables, not
// copied from the request, so the base must recognise the source end.
#include <cstring>

#include "CmpiProviderFactory.h"
#include "TestInventory.h"
#include "platform/OmcSimpleAssociationMI.h"

namespace {

using namespace omctest;

class DeviceAssociationProvider : public OMC::SimpleAssociationMI {
public:
    DeviceAssociationProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), SimpleAssociationMI(mb, ctx) {}

    CmpiStatus doReferences(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &op,
                            const char *, const char *, const char *, const char *) override {
        const bool fromSystem = op.classPathIsA("Test_System");
        if (!fromSystem && !op.classPathIsA("Test_Device")) return CmpiStatus(CMPI_RC_OK);
        const std::string name = stringKey(op, fromSystem ? "Name" : "DeviceID");
        const CmpiString ns = op.getNameSpace();
        CmpiInstance hosted(CmpiObjectPath(ns, "Test_HostedDevice"));
        CmpiInstance spare(CmpiObjectPath(ns, "Test_SpareDevice"));
        for (const Link &link : kLinks) {
            if (name != (fromSystem ? link.system : link.device)) continue;
            CmpiInstance &association =
                std::strcmp(link.assocClass, "Test_SpareDevice") == 0 ? spare : hosted;
            association.setProperty("Antecedent", systemPath(link.system));
            association.setProperty("Dependent", devicePath(link.deviceClass, link.device));
            association.setProperty("Note", link.device);
            rslt.returnData(association);
        }
        if (name == kBrokenSystem) return CmpiStatus(CMPI_RC_ERR_FAILED, "broken system");
        return CmpiStatus(CMPI_RC_OK);
    }
};

}  // namespace

CMProviderBase(OmcTestAssociation);
CMAssociationMIFactory(DeviceAssociationProvider, OmcTestAssociation)

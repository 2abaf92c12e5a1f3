// The installed-software association: the hosting computer system and the
// running hypervisor image. The software side comes from the broker (the
// software identity provider answers it), never from here; the image in the
// alternate boot bank is not installed software and is always left out.
#include "CmpiProviderFactory.h"
#include "CmpiResultFilters.h"
#include "frame/KeyText.h"
#include "frame/ReferenceFilters.h"
#include "platform/OmcComputerSystem.h"
#include "platform/OmcSimpleAssociationMI.h"
#include "software/InstalledSystem.h"
#include "software/InstanceId.h"

namespace {

using frame::classFilterAccepts;
using frame::roleFilterMisses;
using Software::computerSystemClass;
using Software::hypervisorIdentityClass;
using Software::installedSoftwareClass;

bool isAltBootBank(const CmpiObjectPath &software) {
    const std::optional<std::string> instanceId = frame::keyText(software, "InstanceID");
    return instanceId && Software::isAltBootBankId(instanceId->c_str());
}

class TalvexInstalledSoftwareIdentity : public virtual CmpiInstanceMI, public virtual OMC::SimpleAssociationMI {
public:
    TalvexInstalledSoftwareIdentity(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), OMC::SimpleAssociationMI(mb, ctx) {}
    ~TalvexInstalledSoftwareIdentity() override = default;

    CmpiStatus enumInstanceNames(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop) override {
        if (!cop.classPathIsA(installedSoftwareClass)) return CmpiStatus(CMPI_RC_OK);
        const CmpiObjectPath system = Software::installedSystemPath(installed, Software::installedSystemNamespace);
        returnInstalledImages(ctx, rslt, cop.getNameSpace(), [&](const CmpiObjectPath &software) {
            CmpiObjectPath association = cop;
            association.setKey("System", CmpiData(system));
            association.setKey("InstalledSoftware", CmpiData(software));
            return association;
        });
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus enumInstances(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        CmpiResultPathToInstanceFilter instances(rslt, ctx, properties, this);
        return enumInstanceNames(ctx, instances, cop);
    }

    CmpiStatus getInstance(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        if (!cop.classPathIsA(installedSoftwareClass)) return CmpiStatus(CMPI_RC_OK);
        const CmpiData key = cop.getKey("InstalledSoftware");
        if (key.isNotFound() || key.isNullValue() || key.type() != CMPI_ref) return CmpiStatus(CMPI_RC_OK);
        const CmpiObjectPath software = key;
        if (!software.classPathIsA(hypervisorIdentityClass)) return CmpiStatus(CMPI_RC_OK);
        try {
            getBroker()->getInstance(ctx, software, nullptr);
        } catch (const CmpiStatus &status) {
            return status;
        }
        CmpiInstance instance(cop);
        instance.setPropertyFilter(properties, nullptr);
        instance.setProperty("System", CmpiData(Software::installedSystemPath(
                                           installed, Software::installedSystemNamespace)));
        instance.setProperty("InstalledSoftware", CmpiData(software));
        rslt.returnData(instance);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus initialize(const CmpiContext &ctx) override {
        const std::string name = OMC::getComputerSystemName(ctx, getBroker());
        installed = Software::captureInstalledSystem(name, OMC::getComputerSystemClassName());
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus doReferences(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op, const char *,
                            const char *resultClass, const char *role, const char *resultRole) override {
        const CmpiString ns = op.getNameSpace();
        if (op.classPathIsA(computerSystemClass)) {
            if (roleFilterMisses(role, "System") || roleFilterMisses(resultRole, "InstalledSoftware") ||
                !classFilterAccepts(ns, hypervisorIdentityClass, resultClass)) {
                return CmpiStatus(CMPI_RC_OK);
            }
            CmpiInstance association(CmpiObjectPath(ns, installedSoftwareClass));
            association.setProperty("System", CmpiData(op));
            returnInstalledImages(ctx, rslt, ns, [&](const CmpiObjectPath &software) -> const CmpiInstance & {
                association.setProperty("InstalledSoftware", CmpiData(software));
                return association;
            });
            return CmpiStatus(CMPI_RC_OK);
        }
        if (op.classPathIsA(hypervisorIdentityClass)) {
            if (roleFilterMisses(role, "InstalledSoftware") || roleFilterMisses(resultRole, "System") ||
                !classFilterAccepts(ns, computerSystemClass, resultClass) || isAltBootBank(op)) {
                return CmpiStatus(CMPI_RC_OK);
            }
            CmpiInstance association(CmpiObjectPath(ns, installedSoftwareClass));
            association.setProperty("InstalledSoftware", CmpiData(op));
            association.setProperty("System", CmpiData(Software::installedSystemPath(installed, ns)));
            rslt.returnData(association);
            rslt.returnDone();
        }
        return CmpiStatus(CMPI_RC_OK);
    }

private:
    // Returns what `associationOf` makes of each image the broker names, the
    // alternate one left out, then the end; nothing at all, not even the
    // end, when the broker names none.
    template <class AssociationOf>
    void returnInstalledImages(const CmpiContext &ctx, CmpiResult &rslt, const CmpiString &ns,
                               AssociationOf associationOf) {
        const CmpiEnumeration names = getBroker()->enumInstanceNames(ctx, CmpiObjectPath(ns, hypervisorIdentityClass));
        if (!names.hasNext()) return;
        while (names.hasNext()) {
            const CmpiObjectPath software = names.getNext();
            if (!isAltBootBank(software)) rslt.returnData(associationOf(software));
        }
        rslt.returnDone();
    }

    Software::InstalledSystem installed{};
};

}  // namespace

CMProviderBase(TalvexInstalledSoftwareIdentity);

CMInstanceMIFactory(TalvexInstalledSoftwareIdentity, TalvexInstalledSoftwareIdentity)
CMAssociationMIFactory(TalvexInstalledSoftwareIdentity, TalvexInstalledSoftwareIdentity)

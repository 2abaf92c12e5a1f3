// The hypervisor software identity provider: the running image and, on a
// host with an alternate boot bank, that image too. Its requests are
// serialised, as each refreshes the two version records the others read.
#include <syslog.h>

#include <vector>

#include "CmpiProviderFactory.h"
#include "frame/KeyText.h"
#include "platform/OmcMutex.h"
#include "software/BootBank.h"
#include "software/HypervisorVersions.h"
#include "software/InstanceId.h"
#include "software/SoftwareIdentity.h"

namespace {

using Software::hypervisorIdentityClass;
using Software::makeInstanceId;

const char *textOf(const CmpiString &text) { return text.isNull() ? "" : text.charPtr(); }

// What each operation logs when asked for another class: the requested
// class and the served one, where the text has room for them.
constexpr const char *enumNamesOfOtherClass =
    "Talvex_HypervisorSoftwareIdentityProvider::enumInstanceNames was for %s, not the One True Class, %s.";
constexpr const char *enumInstancesOfOtherClass =
    "ERR: Talvex_HypervisorSoftwareIdentityProvider::enumInstances::Throwing not supported error!!!!!";
constexpr const char *getInstanceOfOtherClass =
    "Talvex_HypervisorSoftwareIdentityProvider::getInstance was for %s, not the One True Class, %s.";

// Lets a request for the served class through; logs and refuses another.
void requireServedClass(const CmpiObjectPath &cop, const char *message) {
    const CmpiString className = cop.getClassName();
    if (className.equalsIgnoreCase(hypervisorIdentityClass)) return;
    syslog(LOG_ERR, message, textOf(className), hypervisorIdentityClass);
    throw CmpiStatus(CMPI_RC_ERR_NOT_SUPPORTED);
}

class HypervisorSoftwareIdentity : public CmpiInstanceMI {
public:
    HypervisorSoftwareIdentity(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), CmpiInstanceMI(mb, ctx), versions(Software::bootBankFileInUse()) {}
    ~HypervisorSoftwareIdentity() override = default;

    CmpiStatus initialize(const CmpiContext &) override {
        bootTimeMicros = Software::bootTimeMicros();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus enumInstanceNames(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop) override {
        const OMC::MutexLock held(lock);
        for (const SystemVersionInfo *record : refreshedRecords(cop, enumNamesOfOtherClass)) {
            CmpiObjectPath path(cop.getNameSpace(), textOf(cop.getClassName()));
            path.setKey("InstanceID", CmpiData(makeInstanceId(*record)));
            rslt.returnData(path);
        }
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        const OMC::MutexLock held(lock);
        for (const SystemVersionInfo *record : refreshedRecords(cop, enumInstancesOfOtherClass)) {
            CmpiInstance instance(cop);
            instance.setPropertyFilter(properties, nullptr);
            Software::fillSoftwareIdentity(instance, *record, bootTimeMicros);
            rslt.returnData(instance);
        }
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus getInstance(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **properties) override {
        const OMC::MutexLock held(lock);
        const std::vector<const SystemVersionInfo *> known = refreshedRecords(cop, getInstanceOfOtherClass);
        CmpiInstance instance(CmpiObjectPath(cop.getNameSpace(), hypervisorIdentityClass));
        instance.setPropertyFilter(properties, nullptr);
        const std::string instanceId = frame::keyText(cop, "InstanceID").value_or("");
        const SystemVersionInfo *found = nullptr;
        for (const SystemVersionInfo *record : known) {
            if (instanceId == makeInstanceId(*record)) {
                found = record;
                break;
            }
        }
        if (found == nullptr) {
            syslog(LOG_ERR,
                   "Talvex_HypervisorSoftwareIdentityProvider::getInstance: Software instance not found with "
                   "InstanceID = %s",
                   instanceId.c_str());
            throw CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
        }
        Software::fillSoftwareIdentity(instance, *found, bootTimeMicros);
        rslt.returnData(instance);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

private:
    // Under the lock: refuses another class with its message, then refreshes
    // the records; the running image first, then the alternate one when it
    // is known.
    std::vector<const SystemVersionInfo *> refreshedRecords(const CmpiObjectPath &cop,
                                                            const char *messageForOtherClass) {
        requireServedClass(cop, messageForOtherClass);
        versions.gatherVersions();
        std::vector<const SystemVersionInfo *> known{&versions.running()};
        if (versions.altBootBank() != nullptr) known.push_back(versions.altBootBank());
        return known;
    }

    Software::HypervisorVersions versions;
    OMC::Mutex lock;
    std::uint64_t bootTimeMicros = 0;
};

}  // namespace

CMProviderBase(HypervisorSoftwareIdentity);

CMInstanceMIFactory(HypervisorSoftwareIdentity, HypervisorSoftwareIdentity)

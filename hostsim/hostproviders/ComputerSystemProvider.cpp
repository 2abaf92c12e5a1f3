#include "ComputerSystemProvider.h"

#include <string>

#include "CmpiArray.h"
#include "CmpiObjectPath.h"
#include "frame/KeyText.h"
#include "platform/OmcComputerSystem.h"

namespace HostProviders {
namespace {

constexpr CMPIUint16 notDedicated = 0;  // a general-purpose host
constexpr CMPIUint16 enabled = 2;       // it runs: it answers

bool servedClass(const CmpiObjectPath &cop) {
    return cop.getClassName().equalsIgnoreCase(OMC::getComputerSystemClassName().c_str());
}

bool namesSystem(const CmpiObjectPath &cop, const std::string &name) {
    const std::optional<std::string> className = frame::keyText(cop, "CreationClassName");
    const std::optional<std::string> keyName = frame::keyText(cop, "Name");
    return className && CmpiString(*className).equalsIgnoreCase(OMC::getComputerSystemClassName().c_str()) &&
           keyName == name;
}

// Keys in the order the product sets them in its own paths to the system.
CmpiObjectPath systemPath(const CmpiString &ns, const std::string &name) {
    CmpiObjectPath path(ns, OMC::getComputerSystemClassName().c_str());
    path.setKey("Name", CmpiData(name));
    path.setKey("CreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    return path;
}

CmpiInstance systemInstance(const CmpiString &ns, const std::string &name, const char **properties) {
    CmpiInstance instance(systemPath(ns, name));
    instance.setPropertyFilter(properties, nullptr);
    instance.setProperty("CreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    instance.setProperty("Name", CmpiData(name));
    instance.setProperty("ElementName", CmpiData(name));
    CmpiArray dedicated(1, CMPI_uint16);
    dedicated[0] = CmpiData(notDedicated);
    instance.setProperty("Dedicated", dedicated);
    instance.setProperty("EnabledState", CmpiData(enabled));
    return instance;
}

}  // namespace

CmpiStatus enumComputerSystems(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                               const char **properties, CmpiBroker *broker) {
    if (!servedClass(cop)) return CmpiStatus(CMPI_RC_OK);
    rslt.returnData(systemInstance(cop.getNameSpace(), OMC::getComputerSystemName(ctx, broker), properties));
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus getComputerSystem(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties, CmpiBroker *broker) {
    const std::string name = OMC::getComputerSystemName(ctx, broker);
    if (!servedClass(cop) || !namesSystem(cop, name)) return CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
    rslt.returnData(systemInstance(cop.getNameSpace(), name, properties));
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace HostProviders

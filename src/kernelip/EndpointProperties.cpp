#include "kernelip/EndpointProperties.h"

#include "platform/OmcComputerSystem.h"

namespace TVX {

void setEndpointIdentity(CmpiInstance &instance, const char *className, const char *interfaceName,
                         std::int32_t protocolType, const CmpiContext &ctx, CmpiBroker *broker) {
    instance.setProperty("SystemCreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    instance.setProperty("SystemName", CmpiData(OMC::getComputerSystemName(ctx, broker)));
    instance.setProperty("CreationClassName", CmpiData(className));
    instance.setProperty("Name", CmpiData(interfaceName));
    instance.setProperty("ElementName", CmpiData(interfaceName));
    instance.setProperty("NameFormat", CmpiData("Ostrakon Interface Name"));
    instance.setProperty("ProtocolIFType", CmpiData(static_cast<CMPIUint16>(protocolType)));
}

}  // namespace TVX

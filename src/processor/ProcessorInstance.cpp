#include "processor/ProcessorInstance.h"

#include <cstdio>

#include "CmpiArray.h"
#include "CmpiObjectPath.h"
#include "frame/SingleElementArray.h"
#include "platform/OmcComputerSystem.h"

namespace Processor {
namespace {

constexpr CMPIUint16 operationalStatusOk = 2;
constexpr CMPIUint16 characteristicEnabled = 2;
constexpr CMPIUint16 characteristicDisabled = 3;

struct Characteristic {
    uint8_t ProcessorDetails::*present;
    CMPIUint16 value;
};

// Each feature keeps its position, present or not, so clients can index both arrays.
constexpr Characteristic characteristics[] = {
    {&ProcessorDetails::longMode, 2},         // 64-bit Capable
    {&ProcessorDetails::virtualization, 4},   // Enhanced Virtualization
    {&ProcessorDetails::hyperThreading, 5},   // Hardware Thread
    {&ProcessorDetails::noExecute, 6},        // NX-bit
    {&ProcessorDetails::powerManagement, 7},  // Power/Performance Control
};
constexpr unsigned int powerControlIndex = 4;

void setCharacteristics(CmpiInstance &instance, const ProcessorDetails &record) {
    constexpr unsigned int count = sizeof characteristics / sizeof characteristics[0];
    CmpiArray present(count, CMPI_uint16);
    CmpiArray enabled(count, CMPI_uint16);
    for (unsigned int i = 0; i < count; ++i) {
        if (record.*characteristics[i].present == 0) continue;
        present[i] = CmpiData(characteristics[i].value);
        const bool off = i == powerControlIndex && record.dynamicPower == 0;
        enabled[i] = CmpiData(off ? characteristicDisabled : characteristicEnabled);
    }
    instance.setProperty("Characteristics", present);
    instance.setProperty("EnabledProcessorCharacteristics", enabled);
}

CmpiObjectPath buildProcessorPath(const CmpiString &ns, const ProcessorDetails &record,
                                  const CmpiContext &ctx, CmpiBroker *broker) {
    CmpiObjectPath path(ns, processorClass);
    path.setKey("SystemCreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    path.setKey("SystemName", CmpiData(OMC::getComputerSystemName(ctx, broker)));
    path.setKey("CreationClassName", CmpiData(processorClass));
    path.setKey("DeviceID", CmpiData(record.deviceId));
    path.setKey("ElementName", CmpiData(record.deviceId));
    return path;
}

}  // namespace

CmpiInstance buildProcessorInstance(const CmpiString &ns, const ProcessorDetails &record,
                                    const CmpiContext &ctx, CmpiBroker *broker,
                                    const char **properties) {
    CmpiInstance instance(buildProcessorPath(ns, record, ctx, broker));
    instance.setPropertyFilter(properties, nullptr);

    char brand[7];
    std::snprintf(brand, sizeof brand, "0x%4x", unsigned(record.brandId));

    instance.setProperty("SystemCreationClassName", CmpiData(OMC::getComputerSystemClassName()));
    instance.setProperty("SystemName", CmpiData(OMC::getComputerSystemName(ctx, broker)));
    instance.setProperty("CreationClassName", CmpiData(processorClass));
    instance.setProperty("DeviceID", CmpiData(record.deviceId));
    instance.setProperty("ElementName", CmpiData(record.deviceId));
    instance.setProperty("OperationalStatus",
                         frame::singleElementArray(CMPI_uint16, operationalStatusOk));
    instance.setProperty("Vendor", CmpiData(CMPIUint16(record.vendor)));
    instance.setProperty("NumberOfEnabledCores", CmpiData(CMPIUint16(record.enabledCores)));
    instance.setProperty("Stepping", CmpiData(record.stepping));
    instance.setProperty("ModelName", CmpiData(record.modelName));
    instance.setProperty("OtherIdentifyingInfo", frame::singleElementArray(CMPI_string, brand));
    instance.setProperty("IdentifyingDescriptions",
                         frame::singleElementArray(CMPI_string, "Brand ID"));
    instance.setProperty("CPUStatus", CmpiData(CMPIUint16(record.cpuStatus)));
    setCharacteristics(instance, record);
    return instance;
}

}  // namespace Processor

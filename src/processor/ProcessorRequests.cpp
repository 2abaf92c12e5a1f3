#include "processor/ProcessorRequests.h"

#include <cstdlib>
#include <cstring>
#include <vector>

#include "frame/BoundedText.h"
#include "processor/GetProcessorDetails.h"
#include "processor/ProcessorInstance.h"

namespace Processor {
namespace {

constexpr std::size_t positionTextLimit = 64;

bool servedClass(const CmpiObjectPath &cop) {
    return cop.getClassName().equalsIgnoreCase(processorClass);
}

}  // namespace

long processorPosition(const char *deviceId) {
    const char *hyphen = deviceId != nullptr ? std::strrchr(deviceId, '-') : nullptr;
    if (hyphen == nullptr) return -1;
    char number[positionTextLimit + 1];
    frame::copyBounded(number, hyphen + 1, positionTextLimit);
    return std::strtol(number, nullptr, 10);
}

CmpiStatus enumProcessors(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                          const char **properties, CmpiBroker *broker) {
    const CmpiString ns = cop.getNameSpace();
    if (!servedClass(cop)) return CmpiStatus(CMPI_RC_OK);
    std::vector<ProcessorDetails> records;
    if (getProcessorDetails(records) != 0 || records.empty()) return CmpiStatus(CMPI_RC_OK);
    for (const ProcessorDetails &record : records) {
        rslt.returnData(buildProcessorInstance(ns, record, ctx, broker, properties));
    }
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus getProcessor(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                        const char **properties, CmpiBroker *broker) {
    const CmpiString ns = cop.getNameSpace();
    if (!servedClass(cop)) return CmpiStatus(CMPI_RC_OK);
    std::vector<ProcessorDetails> records;
    if (getProcessorDetails(records) != 0 || records.empty()) {
        return CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
    }
    const CmpiString deviceId = cop.getKey("DeviceID");
    const long position = processorPosition(deviceId.charPtr());
    if (position < 0 || static_cast<unsigned long>(position) >= records.size()) {
        return CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
    }
    rslt.returnData(buildProcessorInstance(ns, records[position], ctx, broker, properties));
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

}  // namespace Processor

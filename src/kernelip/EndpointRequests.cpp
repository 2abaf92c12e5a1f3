#include "kernelip/EndpointRequests.h"

#include <cstring>
#include <vector>

#include "kernelip/EndpointInstance.h"
#include "kernelip/GetEndpointDetails.h"

namespace TVX {
namespace {

constexpr std::size_t nameLimit = sizeof(endpointDetails::name) - 1;

// Which protocols a class name takes; none for a class not served.
struct Selection {
    bool ipv4;
    bool ipv6;
};

Selection enumerationSelection(const CmpiString &className) {
    if (className.equalsIgnoreCase(ipv4EndpointClass)) return {true, false};
    if (className.equalsIgnoreCase(ipv6EndpointClass)) return {false, true};
    if (className.equalsIgnoreCase("Talvex_KernelIPProtocolEndpoint") ||
        className.equalsIgnoreCase("CIM_IPProtocolEndpoint")) {
        return {true, true};
    }
    return {false, false};
}

const char *recordClass(const endpointDetails &record) {
    return record.protocolType == protocolIPv4 ? ipv4EndpointClass : ipv6EndpointClass;
}

bool readEndpoints(std::vector<endpointDetails> &records) {
    return getendpointDetails(records) == 0 && !records.empty();
}

}  // namespace

CmpiStatus enumEndpoints(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                         const char **properties, CmpiBroker *broker) {
    const CmpiString className = cop.getClassName();
    const CmpiString ns = cop.getNameSpace();
    std::vector<endpointDetails> records;
    if (!readEndpoints(records)) return CmpiStatus(CMPI_RC_OK);
    const Selection selection = enumerationSelection(className);
    if (!selection.ipv4 && !selection.ipv6) return CmpiStatus(CMPI_RC_OK);
    for (const endpointDetails &record : records) {
        const bool chosen = record.protocolType == protocolIPv4 ? selection.ipv4 : selection.ipv6;
        if (!chosen) continue;
        rslt.returnData(buildEndpointInstance(record, ns, properties, recordClass(record), ctx, broker));
    }
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus getEndpoint(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &cop,
                       const char **properties, CmpiBroker *broker) {
    const CmpiString className = cop.getClassName();
    const CmpiString ns = cop.getNameSpace();
    const CmpiString name = cop.getKey("Name");
    std::vector<endpointDetails> records;
    if (!readEndpoints(records)) return CmpiStatus(CMPI_RC_OK);

    int32_t protocol;
    if (className.equalsIgnoreCase(ipv4EndpointClass)) {
        protocol = protocolIPv4;
    } else if (className.equalsIgnoreCase(ipv6EndpointClass)) {
        protocol = protocolIPv6;
    } else {
        return CmpiStatus(CMPI_RC_OK);
    }
    const char *key = name.charPtr() != nullptr ? name.charPtr() : "";
    for (const endpointDetails &record : records) {
        if (record.protocolType != protocol || std::strncmp(record.name, key, nameLimit) != 0) continue;
        rslt.returnData(buildEndpointInstance(record, ns, properties, recordClass(record), ctx, broker));
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
    return CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
}

}  // namespace TVX

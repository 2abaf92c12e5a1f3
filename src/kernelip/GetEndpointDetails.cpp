#include "kernelip/GetEndpointDetails.h"

#include <cstring>

#include "frame/BoundedText.h"
#include "kernelip/IPv6Record.h"
#include "platform/ParamList.h"
#include "platform/SystemInfoSignature.h"

namespace TVX {
namespace {

constexpr int interfaceListNode = 214;
constexpr int ipv4AddressNode = 239;
constexpr int ipv4NetmaskNode = 240;
constexpr int ipv6ListNode = 243;
constexpr int ipv6RecordNode = 244;
constexpr unsigned int failed = 1;

// The text of a list entry; null for a missing entry or one without text.
const char *entryText(PRB_ParamList *list, int index) {
    PRB_Param *entry = PRB_ParamListGetParam(list, index);
    return entry == nullptr ? nullptr : PRB_ParamGetString(entry);
}

endpointDetails namedRecord(const char *interfaceName, int32_t protocolType) {
    endpointDetails record;
    std::memset(&record, 0, sizeof record);
    frame::copyBounded(record.name, interfaceName);
    record.protocolType = protocolType;
    return record;
}

// The walk over the interfaces, with `params` naming the interface (and
// the IPv6 instance) being read. The status word decides the result of a
// walk that reaches its end: every name appended to `params` and every
// IPv6 record read leaves its result there and every IPv6 list read clears
// it, so only a name that could not be appended, with nothing read after
// it, fails the walk.
class EndpointWalk {
public:
    EndpointWalk(PRB_ParamList *params, std::vector<endpointDetails> &endpoints)
        : params_(params), endpoints_(endpoints) {}

    // False when a read failed that fails the whole walk.
    bool readInterface(const char *name) {
        status_ = PRB_ParamListAddString(params_, name);
        if (status_ != 0) return true;
        const bool read = readIPv4(name) && readIPv6(name);
        if (read) PRB_ParamListRemoveLastParam(params_);
        return read;
    }

    int status() const { return status_; }

private:
    // An interface without an IPv4 address has no IPv4 record; one whose
    // netmask cannot be read fails the walk.
    bool readIPv4(const char *name) {
        unsigned char address[4];
        unsigned char netmask[4];
        if (PRB_Get(ipv4AddressNode, params_, address, sizeof address) != 0) return true;
        if (PRB_Get(ipv4NetmaskNode, params_, netmask, sizeof netmask) != 0) return false;
        endpointDetails record = namedRecord(name, protocolIPv4);
        // Both stay in network byte order, as the kernel hands them over.
        std::memcpy(&record.ipv4Address, address, sizeof address);
        std::memcpy(&record.ipv4Netmask, netmask, sizeof netmask);
        endpoints_.push_back(record);
        return true;
    }

    // An interface whose IPv6 list cannot be read has no IPv6 records, and
    // that is no failure.
    bool readIPv6(const char *name) {
        platform::ParamList instances;
        const bool listed = PRB_GetInstanceListAlloc(ipv6ListNode, params_, instances.receive()) == 0;
        status_ = 0;  // listed or not, the interface has been read
        if (!listed || !instances) return true;
        const int count = PRB_ParamListUsedCount(instances.get());
        for (int index = 0; index < count; ++index) {
            const char *instance = entryText(instances.get(), index);
            if (instance == nullptr) continue;
            status_ = PRB_ParamListAddString(params_, instance);
            if (status_ != 0) continue;
            unsigned char bytes[ipv6RecordSize];
            status_ = PRB_Get(ipv6RecordNode, params_, bytes, sizeof bytes);
            if (status_ != 0) return false;
            endpointDetails record = namedRecord(name, protocolIPv6);
            decodeIPv6Record(bytes, record);
            endpoints_.push_back(record);
            PRB_ParamListRemoveLastParam(params_);
        }
        return true;
    }

    PRB_ParamList *params_;
    std::vector<endpointDetails> &endpoints_;
    int status_ = 0;
};

}  // namespace

unsigned int getendpointDetails(std::vector<endpointDetails> &endpoints) {
    if (!platform::systemInfoUsable()) return failed;

    platform::ParamList interfaces;
    if (PRB_GetInstanceListAlloc(interfaceListNode, nullptr, interfaces.receive()) != 0) return failed;
    const int count = interfaces ? PRB_ParamListUsedCount(interfaces.get()) : 0;

    const platform::ParamList params(PRB_ParamListCreate(1, 2));
    if (!params) return failed;

    EndpointWalk walk(params.get(), endpoints);
    for (int index = 0; index < count; ++index) {
        const char *name = entryText(interfaces.get(), index);
        if (name != nullptr && !walk.readInterface(name)) return failed;
    }
    return walk.status() == 0 ? 0 : failed;
}

}  // namespace TVX

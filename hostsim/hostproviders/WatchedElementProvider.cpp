#include "WatchedElementProvider.h"

#include <memory>
#include <optional>
#include <string>

#include "hostsim/HostSimControl.h"

namespace HostProviders {
namespace {

struct AnswerFree {
    void operator()(HostSimWatchedElements *answer) const { HostSim_FreeWatchedElements(answer); }
};
using WatchedElements = std::unique_ptr<HostSimWatchedElements, AnswerFree>;

WatchedElements watchedElements(const CmpiObjectPath &cop, bool enumeration) {
    const CmpiString className = cop.getClassName();
    HostSimWatchedElements *answer = nullptr;
    const int status = HostSim_GetWatchedElements(className.charPtr(), enumeration ? 1 : 0, &answer);
    if (status == HOSTSIM_STATUS_NO_PROFILE) throw CmpiStatus(CMPI_RC_ERR_FAILED, "the host profile cannot be read");
    if (status != HOSTSIM_STATUS_OK) throw CmpiStatus(CMPI_RC_ERR_FAILED, "the request names no class");
    return WatchedElements(answer);
}

CmpiData dataOf(const HostSimValue &value) {
    switch (value.type) {
    case HOSTSIM_VALUE_UINT16: return CmpiData(static_cast<CMPIUint16>(value.unsignedValue));
    case HOSTSIM_VALUE_UINT64: return CmpiData(static_cast<CMPIUint64>(value.unsignedValue));
    case HOSTSIM_VALUE_SINT64: return CmpiData(static_cast<CMPISint64>(value.signedValue));
    case HOSTSIM_VALUE_BOOLEAN: return CmpiData(value.unsignedValue != 0);
    case HOSTSIM_VALUE_STRING: return CmpiData(value.text);
    case HOSTSIM_VALUE_NULL:
    default: return CmpiData::nullOf(CMPI_uint16);  // HealthState's type
    }
}

CmpiObjectPath elementPath(const HostSimWatchedElement &element) {
    CmpiObjectPath path(element.nameSpace, element.className);
    if (element.hostName != nullptr) path.setHostname(element.hostName);
    for (std::size_t i = 0; i < element.keyCount; ++i) {
        path.setKey(element.keys[i].name, dataOf(element.keys[i].value));
    }
    return path;
}

CmpiInstance elementInstance(const HostSimWatchedElement &element, const char **properties) {
    CmpiInstance instance(elementPath(element));
    instance.setPropertyFilter(properties, nullptr);
    if (element.healthState.type != HOSTSIM_VALUE_MISSING) {
        instance.setProperty("HealthState", dataOf(element.healthState));
    }
    return instance;
}

// An integer key's value whatever its width and signedness, so that a
// client's key of another integer type than the profile's still names it.
struct IntegerKey {
    bool negative;
    CMPIUint64 magnitude;
    bool operator==(const IntegerKey &other) const {
        return negative == other.negative && magnitude == other.magnitude;
    }
};

IntegerKey integerKey(CMPISint64 value) {
    return value < 0 ? IntegerKey{true, CMPIUint64(0) - static_cast<CMPIUint64>(value)}
                     : IntegerKey{false, static_cast<CMPIUint64>(value)};
}

IntegerKey integerKey(CMPIUint64 value) { return IntegerKey{false, value}; }

std::optional<IntegerKey> integerKey(const CMPIData &data) {
    const CMPIValue &v = data.value;
    switch (data.type) {
    case CMPI_uint8: return integerKey(CMPIUint64(v.uint8));
    case CMPI_uint16: return integerKey(CMPIUint64(v.uint16));
    case CMPI_uint32: return integerKey(CMPIUint64(v.uint32));
    case CMPI_uint64: return integerKey(v.uint64);
    case CMPI_sint8: return integerKey(CMPISint64(v.sint8));
    case CMPI_sint16: return integerKey(CMPISint64(v.sint16));
    case CMPI_sint32: return integerKey(CMPISint64(v.sint32));
    case CMPI_sint64: return integerKey(v.sint64);
    default: return std::nullopt;
    }
}

bool sameKeyValue(const CmpiData &asked, const HostSimValue &scripted) {
    if (asked.isNotFound() || asked.isNullValue()) return false;
    switch (scripted.type) {
    case HOSTSIM_VALUE_STRING: {
        if (asked.type() != CMPI_string && asked.type() != CMPI_chars) return false;
        const char *text = asked;
        return text != nullptr && std::string(text) == scripted.text;
    }
    case HOSTSIM_VALUE_BOOLEAN:
        return asked.type() == CMPI_boolean && static_cast<bool>(asked) == (scripted.unsignedValue != 0);
    case HOSTSIM_VALUE_UINT64: return integerKey(asked.getEnc()) == integerKey(CMPIUint64(scripted.unsignedValue));
    case HOSTSIM_VALUE_SINT64: return integerKey(asked.getEnc()) == integerKey(CMPISint64(scripted.signedValue));
    default: return false;
    }
}

bool namesElement(const CmpiObjectPath &cop, const HostSimWatchedElement &element) {
    if (cop.getKeyCount() != element.keyCount) return false;
    for (std::size_t i = 0; i < element.keyCount; ++i) {
        if (!sameKeyValue(cop.getKey(element.keys[i].name), element.keys[i].value)) return false;
    }
    return true;
}

}  // namespace

CmpiStatus WatchedElementProvider::enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                                                 const char **properties) {
    const WatchedElements watched = watchedElements(cop, true);
    for (std::size_t i = 0; i < watched->count; ++i) {
        rslt.returnData(elementInstance(watched->elements[i], properties));
    }
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus WatchedElementProvider::enumInstanceNames(const CmpiContext &, CmpiResult &rslt,
                                                     const CmpiObjectPath &cop) {
    const WatchedElements watched = watchedElements(cop, false);
    for (std::size_t i = 0; i < watched->count; ++i) rslt.returnData(elementPath(watched->elements[i]));
    rslt.returnDone();
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus WatchedElementProvider::getInstance(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                                               const char **properties) {
    const WatchedElements watched = watchedElements(cop, false);
    for (std::size_t i = 0; i < watched->count; ++i) {
        if (!namesElement(cop, watched->elements[i])) continue;
        rslt.returnData(elementInstance(watched->elements[i], properties));
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }
    return CmpiStatus(CMPI_RC_ERR_NOT_FOUND);
}

}  // namespace HostProviders

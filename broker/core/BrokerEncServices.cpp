// The broker's factory table for encapsulated objects, class tests and
// messages.
#include <sys/time.h>

#include <cstdio>

#include "core/BrokerState.h"
#include "core/EncSupport.h"
#include "model/CimDateTime.h"
#include "model/InstanceOfClass.h"
#include "model/MofInstanceText.h"

namespace tvxbroker {

namespace {

using enc::setRc;

CMPIInstance *newInstance(const CMPIBroker *mb, const CMPIObjectPath *op, CMPIStatus *rc) {
    EncObjectPath *path = enc::pathOf(op);
    if (path == nullptr) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    const ClassSchema &schema = stateOf(mb).config.schema;
    CMPIInstance *handle = enc::newInstance(instanceOfClass(path->value, schema));
    enc::instanceOf(handle)->schema = &schema;
    return handle;
}

CMPIObjectPath *newObjectPath(const CMPIBroker *, const char *ns, const char *cn,
                              CMPIStatus *rc) {
    setRc(rc, CMPI_RC_OK);
    return enc::newObjectPath(ObjectPath{"", ns != nullptr ? ns : "", cn != nullptr ? cn : "", {}});
}

CMPIArgs *newArgs(const CMPIBroker *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return nullptr;
}

CMPIString *newString(const CMPIBroker *, const char *data, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_OK);
    return enc::newString(data != nullptr ? data : "");
}

CMPIArray *newArray(const CMPIBroker *, CMPICount max, CMPIType type, CMPIStatus *rc) {
    CMPIType elementType = static_cast<CMPIType>(type & ~CMPI_ARRAY);
    if (elementType == CMPI_chars) elementType = CMPI_string;
    CimValue array = CimValue::makeNull(static_cast<CMPIType>(elementType | CMPI_ARRAY));
    array.null = false;
    array.elements.assign(max, CimValue::makeNull(elementType));
    setRc(rc, CMPI_RC_OK);
    return enc::newArray(std::move(array));
}

CMPIDateTime *newDateTime(const CMPIBroker *, CMPIStatus *rc) {
    timeval now{};
    gettimeofday(&now, nullptr);
    setRc(rc, CMPI_RC_OK);
    return enc::newDateTime(DateTime{static_cast<std::uint64_t>(now.tv_sec) * 1000000u +
                                         static_cast<std::uint64_t>(now.tv_usec),
                                     false});
}

CMPIDateTime *newDateTimeFromBinary(const CMPIBroker *, CMPIUint64 binTime, CMPIBoolean interval,
                                    CMPIStatus *rc) {
    setRc(rc, CMPI_RC_OK);
    return enc::newDateTime(DateTime{binTime, interval != 0});
}

CMPIDateTime *newDateTimeFromChars(const CMPIBroker *, const char *utcTime, CMPIStatus *rc) {
    DateTime value;
    if (utcTime == nullptr || !parseCimDateTime(utcTime, value)) {
        setRc(rc, CMPI_RC_ERR_INVALID_PARAMETER, "not a CIM datetime");
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    return enc::newDateTime(value);
}

CMPISelectExp *newSelectExp(const CMPIBroker *, const char *query, const char *lang,
                            CMPIArray **projection, CMPIStatus *rc) {
    if (projection != nullptr) *projection = nullptr;
    setRc(rc, CMPI_RC_OK);
    return enc::newSelectExp(query != nullptr ? query : "", lang != nullptr ? lang : "");
}

CMPIBoolean classPathIsA(const CMPIBroker *mb, const CMPIObjectPath *op, const char *type,
                         CMPIStatus *rc) {
    EncObjectPath *path = enc::pathOf(op);
    if (path == nullptr || type == nullptr) {
        setRc(rc, path == nullptr ? CMPI_RC_ERR_INVALID_HANDLE : CMPI_RC_ERR_INVALID_PARAMETER);
        return 0;
    }
    setRc(rc, CMPI_RC_OK);
    return stateOf(mb).config.schema.isA(path->value.className, type) ? 1 : 0;
}

CMPIString *toString(const CMPIBroker *, const void *object, CMPIStatus *rc) {
    const std::string type = enc::typeNameOf(object);
    if (type == "CMPIObjectPath") {
        return enc::objectPathFT.toString(static_cast<const CMPIObjectPath *>(object), rc);
    }
    setRc(rc, CMPI_RC_OK);
    if (type == "CMPIInstance") {
        try {
            return enc::newString(formatInstanceMof(
                enc::instanceOf(static_cast<const CMPIInstance *>(object))->value));
        } catch (const std::exception &error) {
            setRc(rc, CMPI_RC_ERR_FAILED, error.what());
            return nullptr;
        }
    }
    if (type == "CMPIString") {
        return enc::newString(enc::stringOf(static_cast<const CMPIString *>(object))->text);
    }
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return nullptr;
}

CMPIBoolean isOfType(const CMPIBroker *, const void *object, const char *type, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_OK);
    return type != nullptr && enc::typeNameOf(object) == type ? 1 : 0;
}

CMPIString *getType(const CMPIBroker *, const void *object, CMPIStatus *rc) {
    const std::string type = enc::typeNameOf(object);
    if (type.empty()) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    return enc::newString(type);
}

// The embedded broker has no message catalogues: the default text stands.
CMPIString *getMessage(const CMPIBroker *, const char *, const char *defMsg, CMPIStatus *rc,
                       CMPICount, ...) {
    setRc(rc, CMPI_RC_OK);
    return enc::newString(defMsg != nullptr ? defMsg : "");
}

CMPIStatus logMessage(const CMPIBroker *, int severity, const char *id, const char *text,
                      const CMPIString *string) {
    const EncString *message = enc::stringOf(string);
    std::fprintf(stderr, "tvxbroker: log %d %s: %s\n", severity, id != nullptr ? id : "-",
                 text != nullptr ? text : (message != nullptr ? message->text.c_str() : ""));
    return enc::status(CMPI_RC_OK);
}

CMPIStatus trace(const CMPIBroker *, int, const char *, const char *, const CMPIString *) {
    return enc::status(CMPI_RC_OK);
}

CMPIError *newCMPIError(const CMPIBroker *, const char *, const char *, const char *,
                        const CMPIErrorSeverity, const CMPIErrorProbableCause, const CMPIrc,
                        CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return nullptr;
}

CMPIStatus openMessageFile(const CMPIBroker *, const char *, CMPIMsgFileHandle *handle) {
    if (handle != nullptr) *handle = nullptr;
    return enc::status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus closeMessageFile(const CMPIBroker *, const CMPIMsgFileHandle) {
    return enc::status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIString *getMessage2(const CMPIBroker *, const char *, const CMPIMsgFileHandle,
                        const char *defMsg, CMPIStatus *rc, CMPICount, ...) {
    setRc(rc, CMPI_RC_OK);
    return enc::newString(defMsg != nullptr ? defMsg : "");
}

}  // namespace

const CMPIBrokerEncFT brokerEncFT = {
    CMPICurrentVersion, newInstance,  newObjectPath,         newArgs,
    newString,          newArray,     newDateTime,           newDateTimeFromBinary,
    newDateTimeFromChars, newSelectExp, classPathIsA,        toString,
    isOfType,           getType,      getMessage,            logMessage,
    trace,              newCMPIError, openMessageFile,       closeMessageFile,
    getMessage2};

}  // namespace tvxbroker

#include "core/EncSupport.h"
#include "model/PathText.h"

namespace tvxbroker::enc {

namespace {

CMPIStatus pathRelease(CMPIObjectPath *op) { return releaseOf(pathOf(op)); }
CMPIObjectPath *pathClone(const CMPIObjectPath *op, CMPIStatus *rc) {
    return cloneOf(pathOf(op), rc);
}


CMPIStatus setText(CMPIObjectPath *op, std::string ObjectPath::*member, const char *text) {
    EncObjectPath *path = pathOf(op);
    if (path == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    path->value.*member = text != nullptr ? text : "";
    return status(CMPI_RC_OK);
}

CMPIString *getText(const CMPIObjectPath *op, std::string ObjectPath::*member, CMPIStatus *rc) {
    EncObjectPath *path = reportLookup(pathOf(op), rc);
    return path == nullptr ? nullptr : newString(path->value.*member);
}

CMPIStatus setNameSpace(CMPIObjectPath *op, const char *ns) {
    return setText(op, &ObjectPath::nameSpace, ns);
}
CMPIString *getNameSpace(const CMPIObjectPath *op, CMPIStatus *rc) {
    return getText(op, &ObjectPath::nameSpace, rc);
}
CMPIStatus setHostname(CMPIObjectPath *op, const char *host) {
    return setText(op, &ObjectPath::host, host);
}
// A path without a host answers a string whose characters are null, as in
// sfcb, never an empty text.
CMPIString *getHostname(const CMPIObjectPath *op, CMPIStatus *rc) {
    CMPIString *host = getText(op, &ObjectPath::host, rc);
    if (EncString *text = stringOf(host); text != nullptr && text->text.empty()) text->null = true;
    return host;
}
CMPIStatus setClassName(CMPIObjectPath *op, const char *cn) {
    return setText(op, &ObjectPath::className, cn);
}
CMPIString *getClassName(const CMPIObjectPath *op, CMPIStatus *rc) {
    return getText(op, &ObjectPath::className, rc);
}

CMPIStatus addKey(CMPIObjectPath *op, const char *name, const CMPIValue *value, CMPIType type) {
    EncObjectPath *path = pathOf(op);
    if (path == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (name == nullptr) return status(CMPI_RC_ERR_INVALID_PARAMETER, "key without a name");
    CMPIrc rc = CMPI_RC_OK;
    CimValue key = toModel(value, type, &rc);
    if (rc != CMPI_RC_OK) return status(rc);
    for (NamedValue &existing : path->value.keys) {
        if (equalsIgnoreCase(existing.name, name)) {
            existing.value = std::move(key);
            return status(CMPI_RC_OK);
        }
    }
    path->value.keys.push_back(NamedValue{name, std::move(key)});
    return status(CMPI_RC_OK);
}

CMPIData getKey(const CMPIObjectPath *op, const char *name, CMPIStatus *rc) {
    EncObjectPath *path = reportLookup(pathOf(op), rc);
    if (path == nullptr) return notFoundData();
    const CimValue *key = name != nullptr ? path->value.key(name) : nullptr;
    if (key == nullptr) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
        return notFoundData();
    }
    CMPIData data = toCmpi(*key);
    data.state |= CMPI_keyValue;
    return data;
}

CMPIData getKeyAt(const CMPIObjectPath *op, CMPICount index, CMPIString **name,
                  CMPIStatus *rc) {
    EncObjectPath *path = reportLookup(pathOf(op), rc);
    if (path == nullptr) return notFoundData();
    if (index >= path->value.keys.size()) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY, "key index out of range");
        return notFoundData();
    }
    const NamedValue &key = path->value.keys[index];
    if (name != nullptr) *name = newString(key.name);
    CMPIData data = toCmpi(key.value);
    data.state |= CMPI_keyValue;
    return data;
}

CMPICount getKeyCount(const CMPIObjectPath *op, CMPIStatus *rc) {
    EncObjectPath *path = reportLookup(pathOf(op), rc);
    return path == nullptr ? 0 : static_cast<CMPICount>(path->value.keys.size());
}

CMPIStatus setNameSpaceFrom(CMPIObjectPath *op, const CMPIObjectPath *src) {
    EncObjectPath *path = pathOf(op);
    EncObjectPath *source = pathOf(src);
    if (path == nullptr || source == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    path->value.nameSpace = source->value.nameSpace;
    return status(CMPI_RC_OK);
}

CMPIStatus setHostAndNameSpaceFrom(CMPIObjectPath *op, const CMPIObjectPath *src) {
    EncObjectPath *path = pathOf(op);
    EncObjectPath *source = pathOf(src);
    if (path == nullptr || source == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    path->value.nameSpace = source->value.nameSpace;
    path->value.host = source->value.host;
    return status(CMPI_RC_OK);
}

// The embedded broker keeps no qualifiers.
CMPIData noClassQualifier(const CMPIObjectPath *, const char *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return notFoundData();
}
CMPIData noPropertyQualifier(const CMPIObjectPath *, const char *, const char *,
                             CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return notFoundData();
}
CMPIData noParameterQualifier(const CMPIObjectPath *, const char *, const char *, const char *,
                              CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return notFoundData();
}

CMPIString *pathToString(const CMPIObjectPath *op, CMPIStatus *rc) {
    EncObjectPath *path = reportLookup(pathOf(op), rc);
    if (path == nullptr) return nullptr;
    try {
        return newString(formatPath(path->value));
    } catch (const std::exception &error) {
        setRc(rc, CMPI_RC_ERR_FAILED, error.what());
        return nullptr;
    }
}

}  // namespace

const CMPIObjectPathFT objectPathFT = {
    CMPICurrentVersion, pathRelease,      pathClone,           setNameSpace,
    getNameSpace,       setHostname,      getHostname,         setClassName,
    getClassName,       addKey,           getKey,              getKeyAt,
    getKeyCount,        setNameSpaceFrom, setHostAndNameSpaceFrom, noClassQualifier,
    noPropertyQualifier, noPropertyQualifier, noParameterQualifier, pathToString};

CMPIObjectPath *newObjectPath(ObjectPath value) {
    EncObjectPath *p = makePooled<EncObjectPath>(&objectPathFT);
    p->value = std::move(value);
    return &p->cmpi;
}

EncObjectPath *pathOf(const CMPIObjectPath *h) { return lookup<EncObjectPath>(h, &objectPathFT); }

}  // namespace tvxbroker::enc

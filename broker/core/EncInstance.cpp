#include <algorithm>
#include <cctype>

#include "core/EncSupport.h"
#include "model/InstanceOfClass.h"

namespace tvxbroker::enc {

namespace {

std::string lowered(const std::string &text) {
    std::string out = text;
    std::transform(out.begin(), out.end(), out.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return out;
}

bool admitted(const EncInstance &instance, const std::string &name) {
    return !instance.filter || instance.filter->count(lowered(name)) != 0;
}

CMPIStatus instanceRelease(CMPIInstance *inst) { return releaseOf(instanceOf(inst)); }
CMPIInstance *instanceClone(const CMPIInstance *inst, CMPIStatus *rc) {
    return cloneOf(instanceOf(inst), rc);
}


CMPIData getProperty(const CMPIInstance *inst, const char *name, CMPIStatus *rc) {
    EncInstance *instance = reportLookup(instanceOf(inst), rc);
    if (instance == nullptr) return notFoundData();
    const CimValue *value = name != nullptr ? instance->value.property(name) : nullptr;
    if (value == nullptr) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
        return notFoundData();
    }
    return toCmpi(*value);
}

CMPIData getPropertyAt(const CMPIInstance *inst, CMPICount index, CMPIString **name,
                       CMPIStatus *rc) {
    EncInstance *instance = reportLookup(instanceOf(inst), rc);
    if (instance == nullptr) return notFoundData();
    if (index >= instance->value.properties.size()) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY, "property index out of range");
        return notFoundData();
    }
    const NamedValue &property = instance->value.properties[index];
    if (name != nullptr) *name = newString(property.name);
    return toCmpi(property.value);
}

CMPICount getPropertyCount(const CMPIInstance *inst, CMPIStatus *rc) {
    EncInstance *instance = reportLookup(instanceOf(inst), rc);
    return instance == nullptr ? 0 : static_cast<CMPICount>(instance->value.properties.size());
}

CMPIStatus setPropertyWithOrigin(const CMPIInstance *inst, const char *name,
                                 const CMPIValue *value, CMPIType type, const char *) {
    EncInstance *instance = instanceOf(inst);
    if (instance == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (name == nullptr) return status(CMPI_RC_ERR_INVALID_PARAMETER, "property without a name");
    CMPIrc rc = CMPI_RC_OK;
    CimValue property = toModel(value, type, &rc);
    if (rc != CMPI_RC_OK) return status(rc);
    // A property outside the filter is dropped, as a real broker does.
    if (!admitted(*instance, name)) return status(CMPI_RC_OK);
    for (NamedValue &existing : instance->value.properties) {
        if (equalsIgnoreCase(existing.name, name)) {
            existing.value = std::move(property);
            return status(CMPI_RC_OK);
        }
    }
    instance->value.properties.push_back(NamedValue{name, std::move(property)});
    return status(CMPI_RC_OK);
}

CMPIStatus setProperty(const CMPIInstance *inst, const char *name, const CMPIValue *value,
                       CMPIType type) {
    return setPropertyWithOrigin(inst, name, value, type, nullptr);
}

CMPIObjectPath *getObjectPath(const CMPIInstance *inst, CMPIStatus *rc) {
    EncInstance *instance = reportLookup(instanceOf(inst), rc);
    if (instance == nullptr) return nullptr;
    return newObjectPath(instance->schema != nullptr ? pathFromClassKeys(instance->value, *instance->schema)
                                                     : instance->value.path);
}

CMPIStatus setPropertyFilter(CMPIInstance *inst, const char **properties, const char **keys) {
    EncInstance *instance = instanceOf(inst);
    if (instance == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (properties == nullptr) {
        instance->filter.reset();
        return status(CMPI_RC_OK);
    }
    std::set<std::string> names;
    for (const char **name = properties; *name != nullptr; ++name) names.insert(lowered(*name));
    for (const char **key = keys; key != nullptr && *key != nullptr; ++key) {
        names.insert(lowered(*key));
    }
    // As in sfcb, the filter keeps out later properties only: what the
    // instance already holds (its class defaults and the keys of its path)
    // stays.
    instance->filter = std::move(names);
    return status(CMPI_RC_OK);
}

CMPIStatus setObjectPath(CMPIInstance *inst, const CMPIObjectPath *op) {
    EncInstance *instance = instanceOf(inst);
    EncObjectPath *path = pathOf(op);
    if (instance == nullptr || path == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    instance->value.path = path->value;
    return status(CMPI_RC_OK);
}

}  // namespace

const CMPIInstanceFT instanceFT = {
    CMPICurrentVersion, instanceRelease, instanceClone,     getProperty,
    getPropertyAt,      getPropertyCount, setProperty,      getObjectPath,
    setPropertyFilter,  setObjectPath,   setPropertyWithOrigin};

CMPIInstance *newInstance(Instance value) {
    EncInstance *i = makePooled<EncInstance>(&instanceFT);
    i->value = std::move(value);
    return &i->cmpi;
}

EncInstance *instanceOf(const CMPIInstance *h) { return lookup<EncInstance>(h, &instanceFT); }

}  // namespace tvxbroker::enc

#include "model/InstanceOfClass.h"

namespace tvxbroker {

namespace {

void setProperty(Instance &instance, const std::string &name, const CimValue &value) {
    for (NamedValue &property : instance.properties) {
        if (equalsIgnoreCase(property.name, name)) {
            property.value = value;
            return;
        }
    }
    instance.properties.push_back({name, value});
}

}  // namespace

Instance instanceOfClass(const ObjectPath &path, const ClassSchema &schema) {
    Instance instance{path, {}};
    if (schema.find(path.className) != nullptr) {
        for (const PropertyDecl &property : schema.propertiesOf(path.className)) {
            if (!property.defaultValue.null) instance.properties.push_back({property.name, property.defaultValue});
        }
    }
    for (const NamedValue &key : path.keys) setProperty(instance, key.name, key.value);
    return instance;
}

ObjectPath pathFromClassKeys(const Instance &instance, const ClassSchema &schema) {
    if (schema.find(instance.path.className) == nullptr) return instance.path;
    ObjectPath path{instance.path.host, instance.path.nameSpace, instance.path.className, {}};
    for (const PropertyDecl &key : schema.keysOf(instance.path.className)) {
        const CimValue *value = instance.property(key.name);
        if (value != nullptr && !value->null) path.keys.push_back({key.name, *value});
    }
    return path;
}

}  // namespace tvxbroker

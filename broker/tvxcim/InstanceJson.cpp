#include "tvxcim/InstanceJson.h"

#include <cmath>

#include "model/CimDateTime.h"
#include "model/CimTypes.h"
#include "model/PathText.h"
#include "model/ValueText.h"

namespace tvxcim {

using tvxbroker::CimValue;
using tvxbroker::ValueKind;

namespace {

Json typeJson(const CimValue &value) {
    const CMPIType scalar = value.elementType();
    std::string name;
    switch (tvxbroker::valueKind(scalar)) {
    case ValueKind::Reference: name = "reference"; break;
    case ValueKind::Instance: name = "instance"; break;
    case ValueKind::Text: name = "string"; break;  // chars as well
    default: name = tvxbroker::cimTypeName(scalar); break;
    }
    if (name.empty()) return nullptr;
    return value.isArray() ? name + "[]" : name;
}

Json realJson(double real) {
    if (std::isnan(real)) return "NaN";
    if (std::isinf(real)) return real > 0 ? "Infinity" : "-Infinity";
    return real;
}

Json scalarJson(const CimValue &scalar) {
    if (scalar.null) return nullptr;
    const bool wide = tvxbroker::integerBits(scalar.type) == 64;
    switch (tvxbroker::valueKind(scalar.type)) {
    case ValueKind::Boolean:
        return scalar.boolean;
    case ValueKind::Unsigned:
        if (scalar.type == CMPI_char16) return tvxbroker::char16Text(scalar.unsignedValue);
        if (wide) return std::to_string(scalar.unsignedValue);
        return scalar.unsignedValue;
    case ValueKind::Signed:
        if (wide) return std::to_string(scalar.signedValue);
        return scalar.signedValue;
    case ValueKind::Real:
        return realJson(scalar.real);
    case ValueKind::Text:
        return scalar.text;
    case ValueKind::DateTime:
        return tvxbroker::formatCimDateTime(scalar.dateTime);
    case ValueKind::Reference:
        if (scalar.reference) return pathJson(*scalar.reference);
        break;
    case ValueKind::Instance:
        if (scalar.instance) return instanceJson(*scalar.instance);
        break;
    case ValueKind::None:
        break;
    }
    return nullptr;
}

Json namedValuesJson(const std::vector<tvxbroker::NamedValue> &values) {
    Json object = Json::object();
    for (const tvxbroker::NamedValue &named : values) object[named.name] = valueJson(named.value);
    return object;
}

}  // namespace

Json valueJson(const CimValue &value) {
    Json json = Json::object();
    json["type"] = typeJson(value);
    if (value.isArray() && !value.null) {
        Json elements = Json::array();
        for (const CimValue &element : value.elements) elements.push_back(scalarJson(element));
        json["value"] = std::move(elements);
    } else {
        json["value"] = scalarJson(value);
    }
    return json;
}

Json pathJson(const tvxbroker::ObjectPath &path) {
    Json json = Json::object();
    json["text"] = tvxbroker::formatPath(path);
    json["namespace"] = path.nameSpace;
    json["className"] = path.className;
    json["keys"] = namedValuesJson(path.keys);
    return json;
}

Json instanceJson(const tvxbroker::Instance &instance) {
    Json json = Json::object();
    json["className"] = instance.path.className;
    json["path"] = pathJson(instance.path);
    json["properties"] = namedValuesJson(instance.properties);
    return json;
}

std::string jsonLine(const Json &json) {
    return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

}  // namespace tvxcim

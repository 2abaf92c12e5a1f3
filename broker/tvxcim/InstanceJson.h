// Instances, object paths and CIM values as JSON, for tvxcim --json.
//
// An instance is {"className", "path", "properties"}; a path is {"text",
// "namespace", "className", "keys"}, "text" being the form tvxcim reads back;
// properties and keys map each name (in stored order) to {"type", "value"}.
// "type" is the MOF type name ("uint32", "datetime"), "reference" or
// "instance", with "[]" appended for an array; a value of a type without a
// name has type null. NULL is null. uint64 and sint64 values are decimal
// strings, so that no JSON reader rounds them to a double; the other
// integers and reals are numbers, except the reals JSON cannot write: "NaN",
// "Infinity", "-Infinity". char16, datetime and string values are strings; a
// reference value is a path, an embedded instance an instance.
#pragma once

#include <nlohmann/json.hpp>

#include <string>

#include "model/CimValue.h"

namespace tvxcim {

using Json = nlohmann::ordered_json;

Json instanceJson(const tvxbroker::Instance &instance);
Json pathJson(const tvxbroker::ObjectPath &path);
Json valueJson(const tvxbroker::CimValue &value);

// The object on one line. Bytes that are not UTF-8 (a provider's string can
// hold anything) become U+FFFD instead of failing the whole output.
std::string jsonLine(const Json &json);

}  // namespace tvxcim

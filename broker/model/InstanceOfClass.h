// How sfcb shapes an instance by its class: a new instance starts with the
// class's default values and the keys of the path it was made from, and the
// path a client sees is made of the class's key properties.
#pragma once

#include "model/ClassSchema.h"
#include "model/CimValue.h"

namespace tvxbroker {

// An instance on `path` holding every non-null default of its class, then
// each key of `path` as a property. A class the schema lacks gives the keys
// alone.
Instance instanceOfClass(const ObjectPath &path, const ClassSchema &schema);

// The instance's host, namespace and class with one key per key property of
// the class that the instance holds with a value. A class the schema lacks
// keeps the instance's own path.
ObjectPath pathFromClassKeys(const Instance &instance, const ClassSchema &schema);

}  // namespace tvxbroker

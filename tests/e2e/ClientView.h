// Answers as a client compares them: an object path by its canonical text,
// whatever spelling, key order or key value type a provider used, and an
// instance by the name a client builds from its key properties.
#pragma once

#include <string>
#include <vector>

#include "core/Broker.h"

namespace consistency {

// The path text with the namespace in lower case, class and key names as the
// MOF declares them, keys in name order (references within likewise) and
// without the host.
std::string canonicalText(const tvxbroker::ObjectPath &path, const tvxbroker::ClassSchema &schema);

// The instance's class and namespace with the values of every key property
// the MOF declares for its class; a key the instance lacks is left out.
tvxbroker::ObjectPath nameOf(const tvxbroker::Instance &instance, const tvxbroker::ClassSchema &schema);

// The reference properties of an association class, inherited ones
// included, each once.
std::vector<tvxbroker::PropertyDecl> rolesOf(const std::string &associationClass,
                                             const tvxbroker::ClassSchema &schema);

}  // namespace consistency

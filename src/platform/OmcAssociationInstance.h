// Reading association instances the way a traversal needs them: their
// references, and a copy that a client can use as it stands.
#pragma once

#include <vector>

#include "CmpiInstance.h"

namespace OMC {

// One reference property of an association instance: the role it names
// and the object it refers to.
struct AssociationEnd {
    CmpiString role;
    CmpiObjectPath path;
};

// The non-null reference properties, in property order.
std::vector<AssociationEnd> associationEnds(const CmpiInstance &association);

// `path` itself when it has a namespace, else a copy of it in `ns`.
CmpiObjectPath withNamespace(const CmpiObjectPath &path, const CmpiString &ns);

// A copy of `association` as it stands now. Providers build association
// instances on a path without keys, so the copy's path also carries every
// reference as a key, and `ns` when the path has no namespace. With a
// property list, only the listed properties, the keys and the references
// are kept.
CmpiInstance copyAssociation(const CmpiInstance &association, const CmpiString &ns,
                             const char **properties);

}  // namespace OMC

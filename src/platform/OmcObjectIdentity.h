// Whether two object paths name the same CIM object, as an association
// traversal must decide when it looks for the end it started from.
#pragma once

#include "CmpiObjectPath.h"

namespace OMC {

// Same class (names equal ignoring case, or one derived from the other by
// the broker's class hierarchy) and the same keys with equal values.
// Namespace and host are not compared: a reference often carries neither.
// Integer keys compare by value whatever their CMPI width; references
// compare by this same rule.
bool sameObject(const CmpiObjectPath &a, const CmpiObjectPath &b);

}  // namespace OMC

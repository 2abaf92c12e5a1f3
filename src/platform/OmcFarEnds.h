// The objects at the far ends of associations, fetched through the broker
// without its getInstance up-call: sfcb serves that up-call to a provider in
// the same process by taking the first answer unseen, so a provider that
// answers "no such instance" with OK and nothing kills the process. An
// enumeration up-call survives an empty answer.
#pragma once

#include <vector>

#include "CmpiBroker.h"

namespace OMC {

// One enumeration per far-end class, matched to the far ends by sameObject;
// the instances come in far-end order, and a far end that no provider
// serves, or whose enumeration fails, is left out. With a property list the
// far ends' key properties are asked for too, so the instances can be
// matched.
std::vector<CmpiInstance> fetchFarEnds(const CmpiBroker &broker, const CmpiContext &ctx,
                                       const std::vector<CmpiObjectPath> &farEnds,
                                       const char **properties);

}  // namespace OMC

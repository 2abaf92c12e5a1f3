// The kernel information nodes the stand-in serves. Each node lives in a file
// of its own that defines a NodeRegistration at namespace scope; the library
// is linked from object files, so every registration runs when it loads.
#pragma once

#include <cstddef>
#include <memory>

#include "profile/HostProfile.h"
#include "serving/ParamList.h"

namespace hostsim {

// Both return a HostSimStatus. `out` is an empty list and `record` is
// recordSize zeroed bytes; what they leave there reaches the caller only on
// success. A node resets `out` to succeed without handing out a list.
using ListInstances = int (*)(const HostProfile &profile, const PRB_ParamList *parent,
                              std::unique_ptr<PRB_ParamList> &out);
using ReadRecord = int (*)(const HostProfile &profile, const PRB_ParamList *params, unsigned char *record);

struct NodeDefinition {
    int number;
    ListInstances listInstances;  // null: the node has no instance list
    std::size_t recordSize;       // 0: the node has no value
    ReadRecord read;
};

const NodeDefinition *findNode(int number);

class NodeRegistration {
public:
    explicit NodeRegistration(const NodeDefinition &node);
};

}  // namespace hostsim

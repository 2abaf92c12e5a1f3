#include "nodes/NodeRegistry.h"

#include <cstdio>
#include <cstdlib>
#include <map>

namespace hostsim {

namespace {

// Filled while the library's static objects are constructed, read-only after.
std::map<int, NodeDefinition> &nodes() {
    static std::map<int, NodeDefinition> registered;
    return registered;
}

}  // namespace

const NodeDefinition *findNode(int number) {
    const auto found = nodes().find(number);
    return found == nodes().end() ? nullptr : &found->second;
}

NodeRegistration::NodeRegistration(const NodeDefinition &node) {
    if (!nodes().emplace(node.number, node).second) {
        std::fprintf(stderr, "hostsim: node %d is defined twice\n", node.number);
        std::abort();
    }
}

}  // namespace hostsim

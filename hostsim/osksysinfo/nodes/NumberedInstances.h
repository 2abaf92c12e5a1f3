// Nodes whose instances are known by number: the instance list holds the
// numbers as integers, and a read names one instance by an integer as the
// call's only parameter.
#pragma once

#include <cstdint>
#include <memory>

#include "hostsim/HostSimControl.h"
#include "nodes/NodeParams.h"
#include "profile/InstanceTable.h"

namespace hostsim {

template <typename Instance>
int listNumbered(const InstanceTable<Instance> &table, const PRB_ParamList *parent, PRB_ParamList &out) {
    if (!hasNoParams(parent)) return HOSTSIM_STATUS_BAD_ARGUMENT;
    // Built in place: moving a temporary variant here trips GCC 12's
    // maybe-uninitialized warning at -O2.
    for (const Instance &instance : table.inOrder()) {
        out.entries.emplace_back().value.template emplace<std::int64_t>(instance.instance);
    }
    return HOSTSIM_STATUS_OK;
}

// Hands the instance the call names to `encode`, which writes its record.
template <typename Instance, typename Encode>
int readNumbered(const InstanceTable<Instance> &table, const PRB_ParamList *params, Encode encode) {
    const std::int64_t *number = soleParam<std::int64_t>(params);
    if (number == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const Instance *instance = table.find(*number);
    if (instance == nullptr) return HOSTSIM_STATUS_NOT_FOUND;
    encode(*instance);
    return HOSTSIM_STATUS_OK;
}

}  // namespace hostsim

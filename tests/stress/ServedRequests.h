// Every client operation on every class a broker's registrations serve, as
// requests that can be sent again and again: instance operations on each
// instance class (the changing ones on an instance it serves), the four
// association operations from each end of an association instance, and the
// subscription checks of each indication class. Subscribing itself
// (activation, enable and disable) is left to the caller, which owns the
// subscriptions.
#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "core/Broker.h"

namespace stress {

struct ServedRequest {
    std::string what;  // the operation and its target, for messages
    std::function<tvxbroker::Response(tvxbroker::Broker &)> send;
    // The one instance it is about, for those about one: an instance a
    // provider no longer serves is answered otherwise.
    std::optional<tvxbroker::ObjectPath> instance = std::nullopt;
};

// Built from what the broker serves now.
std::vector<ServedRequest> servedRequests(tvxbroker::Broker &broker);

}  // namespace stress

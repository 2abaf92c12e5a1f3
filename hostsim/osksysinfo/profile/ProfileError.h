// A host profile that cannot be served: the message names the field,
// "adapters[1].speedMbps: expected an integer from 0 to 65535, got 70000".
#pragma once

#include <stdexcept>

namespace hostsim {

class ProfileError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

}  // namespace hostsim

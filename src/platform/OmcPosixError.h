// POSIX thread functions report failure by their return value; the OMC
// wrappers turn it into an exception that names the failing call.
#pragma once

#include <system_error>

namespace OMC {

inline void throwIfFailed(int error, const char *operation) {
    if (error != 0) throw std::system_error(error, std::generic_category(), operation);
}

}  // namespace OMC

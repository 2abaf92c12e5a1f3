// The message a call fails with, so that tables of bad input can list the
// text each entry must produce.
#pragma once

#include <stdexcept>
#include <string>

namespace tvxbroker {

template <typename Exception = std::runtime_error, typename Call>
std::string errorOf(Call call) {
    try {
        call();
    } catch (const Exception &e) {
        return e.what();
    }
    return "no error";
}

}  // namespace tvxbroker

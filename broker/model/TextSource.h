// Reading the text files the broker is configured with, and pointing at the
// line of one that is wrong.
#pragma once

#include <string>

namespace tvxbroker {

// Throws std::runtime_error "cannot read <path>".
std::string readTextFile(const std::string &path);

// Throws std::runtime_error "origin:line: message".
[[noreturn]] void throwAt(const std::string &origin, int line, const std::string &message);

}  // namespace tvxbroker

// An instance written as MOF, the way the command-line client shows it.
#pragma once

#include <string>

#include "model/CimValue.h"

namespace tvxbroker {

// "// <path>", "instance of <Class>", "{", a "    Name = <literal>;" line per
// property in stored order, "};". Embedded instances appear as the quoted
// text of their path. Throws what formatPath throws.
std::string formatInstanceMof(const Instance &instance);

}  // namespace tvxbroker

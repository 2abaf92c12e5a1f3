// The whole of tvxcim as a function: read the command line, run the
// pre-flight checks, load the broker, answer the command. Every failure ends
// in one "tvxcim: ..." line on `err`.
#pragma once

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "tvxcim/CommandLine.h"

namespace tvxcim {

// Runs after the command line is read and before the broker loads anything;
// throws std::runtime_error with a one-line reason when requests could not
// be served as asked.
using PreflightCheck = std::function<void(const CommandLine &)>;

// The checks tvxcim runs: every provider directory exists.
std::vector<PreflightCheck> standardPreflightChecks();

// The exit status: 0 done, 1 bad input or a failed request, 2 a usage error.
int runTvxcim(const std::vector<std::string> &args, std::ostream &out, std::ostream &err,
              const std::vector<PreflightCheck> &checks = standardPreflightChecks());

}  // namespace tvxcim

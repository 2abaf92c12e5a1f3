// What each tvxcim command asks the broker, with the answers going to a
// ResultWriter. Every class the command names is checked against the
// schema before any request is made; bad input and a failed request throw
// std::runtime_error with the one-line reason.
#pragma once

#include "core/Broker.h"
#include "tvxcim/CommandLine.h"
#include "tvxcim/ResultWriter.h"

namespace tvxcim {

void runCommand(tvxbroker::Broker &broker, const CommandLine &line, ResultWriter &writer);

}  // namespace tvxcim

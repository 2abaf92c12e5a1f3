// tvxcim listen: subscribes to every indication class the registration
// serves and prints each indication as it arrives, until --seconds have
// passed or SIGINT or SIGTERM comes.
#pragma once

#include "core/Broker.h"
#include "tvxcim/CommandLine.h"
#include "tvxcim/ResultWriter.h"

namespace tvxcim {

// Throws std::runtime_error when the registration serves no indication
// class or a subscription is refused.
void runListen(tvxbroker::Broker &broker, const CommandLine &line, ResultWriter &writer);

}  // namespace tvxcim

// tvxcim demo: every class the registration serves with instances, the
// associations of the first instance of each, then the first indication of
// each indication class. A failing class is shown in its place and the demo
// goes on.
#pragma once

#include "core/Broker.h"
#include "tvxcim/CommandLine.h"
#include "tvxcim/ResultWriter.h"

namespace tvxcim {

void runDemo(tvxbroker::Broker &broker, const CommandLine &line, ResultWriter &writer);

}  // namespace tvxcim

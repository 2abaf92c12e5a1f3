// What each tvxcim command does with the broker, written to an output
// stream; a failed request becomes a RequestFailed.
#pragma once

#include <ostream>
#include <stdexcept>

#include "core/Broker.h"
#include "tvxcim/CommandLine.h"

namespace tvxcim {

class RequestFailed : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

void runCommand(tvxbroker::Broker &broker, const CommandLine &line, std::ostream &out);

// "CMPI_RC_ERR_NOT_FOUND (6): text"
std::string describeFailure(const tvxbroker::Response &response);

}  // namespace tvxcim

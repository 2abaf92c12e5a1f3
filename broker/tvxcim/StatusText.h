// How tvxcim names the CMPI status a request failed with.
#pragma once

#include <string>

#include "core/Broker.h"

namespace tvxcim {

// "CMPI_RC_ERR_NOT_FOUND"; "CMPI status" for a code CMPI does not name.
const char *rcName(CMPIrc rc);

// "CMPI_RC_ERR_NOT_FOUND (6): text", without ": text" when the provider
// gave no message.
std::string describeFailure(const tvxbroker::Response &response);

}  // namespace tvxcim

// The outcome of a provider operation or broker call: a CMPI return code and
// an optional message. Providers return it or throw it; the dispatch code
// turns it into the request's CMPI status.
#pragma once

#include <string>

#include "cmpi/cmpift.h"

class CmpiStatus {
public:
    CmpiStatus() = default;
    CmpiStatus(CMPIrc rc);  // NOLINT: a bare code converts, as providers expect
    CmpiStatus(CMPIrc rc, const char *msg);
    explicit CmpiStatus(const CMPIStatus &status);

    CMPIrc rc() const { return code; }
    // Null when the status carries no message.
    const char *msg() const { return hasMessage ? message.c_str() : nullptr; }

    // The C form; a message becomes a string the broker owns.
    CMPIStatus toCMPIStatus(const CMPIBroker *broker) const;

private:
    CMPIrc code = CMPI_RC_OK;
    bool hasMessage = false;
    std::string message;
};

// Throws the status when it is not CMPI_RC_OK.
void cmpiCheck(const CMPIStatus &status);

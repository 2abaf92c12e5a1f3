// The invocation context the broker passes with every request.
#pragma once

#include "CmpiData.h"

class CmpiContext {
public:
    CmpiContext() = default;
    explicit CmpiContext(const CMPIContext *handle) : ctx(const_cast<CMPIContext *>(handle)) {}

    CmpiData getEntry(const char *name) const;
    void addEntry(const char *name, const CmpiData &value) const;
    CMPIContext *getEnc() const { return ctx; }

private:
    CMPIContext *ctx = nullptr;
};

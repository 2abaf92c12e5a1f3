// An indication filter's query as the broker hands it to a provider.
#pragma once

#include "CmpiInstance.h"

class CmpiSelectExp {
public:
    CmpiSelectExp() = default;
    explicit CmpiSelectExp(const CMPISelectExp *handle) : se(const_cast<CMPISelectExp *>(handle)) {}

    CmpiString getString() const;  // the query text
    CMPISelectExp *getEnc() const { return se; }

private:
    CMPISelectExp *se = nullptr;
};

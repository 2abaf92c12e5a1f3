// Where a provider returns its answers. The operations are virtual so that a
// result can be wrapped (see CmpiResultFilters.h).
#pragma once

#include "CmpiInstance.h"

class CmpiResult {
public:
    explicit CmpiResult(const CMPIResult *handle) : rslt(const_cast<CMPIResult *>(handle)) {}
    CmpiResult(const CmpiResult &) = default;
    CmpiResult &operator=(const CmpiResult &) = default;
    virtual ~CmpiResult() = default;

    virtual void returnData(const CmpiInstance &instance);
    virtual void returnData(const CmpiObjectPath &path);
    virtual void returnData(const CmpiData &value);
    virtual void returnDone();

    CMPIResult *getEnc() const { return rslt; }

private:
    CMPIResult *handle() const;

    CMPIResult *rslt;
};

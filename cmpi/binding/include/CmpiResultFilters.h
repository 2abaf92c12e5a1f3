// Results that reshape what a provider returns before it reaches the
// broker, so one operation can serve its sibling.
#pragma once

#include "CmpiInstanceMI.h"

// Every instance returned through it reaches the wrapped result as its path.
class CmpiResultInstanceToPathFilter : public CmpiResult {
public:
    explicit CmpiResultInstanceToPathFilter(CmpiResult &target);

    void returnData(const CmpiInstance &instance) override;
    void returnData(const CmpiObjectPath &path) override;
    void returnData(const CmpiData &value) override;
    void returnDone() override;

private:
    CmpiResult &target;
};

// Every path returned through it is answered by the provider's getInstance,
// whose instance reaches the wrapped result; a failing getInstance throws
// its status out of returnData.
class CmpiResultPathToInstanceFilter : public CmpiResult {
public:
    CmpiResultPathToInstanceFilter(CmpiResult &target, const CmpiContext &ctx,
                                   const char **properties, CmpiInstanceMI *provider);

    void returnData(const CmpiInstance &instance) override;
    void returnData(const CmpiObjectPath &path) override;
    void returnData(const CmpiData &value) override;
    void returnDone() override;

private:
    CmpiResult &target;
    CmpiContext ctx;
    const char **properties;
    CmpiInstanceMI *provider;
};

#include "CmpiResultFilters.h"

CmpiResultInstanceToPathFilter::CmpiResultInstanceToPathFilter(CmpiResult &wrapped)
    : CmpiResult(wrapped), target(wrapped) {}

void CmpiResultInstanceToPathFilter::returnData(const CmpiInstance &instance) {
    target.returnData(instance.getObjectPath());
}

void CmpiResultInstanceToPathFilter::returnData(const CmpiObjectPath &path) {
    target.returnData(path);
}

void CmpiResultInstanceToPathFilter::returnData(const CmpiData &value) { target.returnData(value); }

void CmpiResultInstanceToPathFilter::returnDone() { target.returnDone(); }

namespace {

// Passes answers on but keeps the end of results to itself: the filter
// signals it once, when its own caller is done.
class WithoutDone : public CmpiResult {
public:
    explicit WithoutDone(CmpiResult &wrapped) : CmpiResult(wrapped), target(wrapped) {}
    void returnData(const CmpiInstance &instance) override { target.returnData(instance); }
    void returnData(const CmpiObjectPath &path) override { target.returnData(path); }
    void returnData(const CmpiData &value) override { target.returnData(value); }
    void returnDone() override {}

private:
    CmpiResult &target;
};

}  // namespace

CmpiResultPathToInstanceFilter::CmpiResultPathToInstanceFilter(CmpiResult &wrapped,
                                                               const CmpiContext &context,
                                                               const char **propertyList,
                                                               CmpiInstanceMI *instanceProvider)
    : CmpiResult(wrapped),
      target(wrapped),
      ctx(context),
      properties(propertyList),
      provider(instanceProvider) {}

void CmpiResultPathToInstanceFilter::returnData(const CmpiInstance &instance) {
    target.returnData(instance);
}

void CmpiResultPathToInstanceFilter::returnData(const CmpiObjectPath &path) {
    WithoutDone inner(target);
    CmpiStatus status = provider->getInstance(ctx, inner, path, properties);
    if (status.rc() != CMPI_RC_OK) throw status;
}

void CmpiResultPathToInstanceFilter::returnData(const CmpiData &value) { target.returnData(value); }

void CmpiResultPathToInstanceFilter::returnDone() { target.returnDone(); }

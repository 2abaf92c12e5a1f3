// The result a provider's doReferences writes into: it keeps a copy of
// each association instance as it was when returned (providers may reuse
// one instance for several answers), so the traversal can filter and
// reshape them before anything reaches the broker.
#pragma once

#include <vector>

#include "CmpiResult.h"

namespace OMC {

class AssociationCollector : public CmpiResult {
public:
    // Copies are made by copyAssociation with `ns` and `properties`.
    AssociationCollector(const CmpiString &ns, const char **properties);

    void returnData(const CmpiInstance &instance) override;
    // An object path or a plain value is not an association: both throw a
    // CmpiStatus with CMPI_RC_ERR_FAILED.
    void returnData(const CmpiObjectPath &path) override;
    void returnData(const CmpiData &value) override;
    // The traversal signals the end of results itself, once.
    void returnDone() override {}

    const std::vector<CmpiInstance> &instances() const { return collected; }

private:
    CmpiString ns;
    const char **properties;
    std::vector<CmpiInstance> collected;
};

}  // namespace OMC

// Talvex_LatchedHealthAssociation: from a latched record (Antecedent) to the
// element whose health it latched (Dependent). Only the record's side can be
// followed; asked from any other object it answers nothing.
#pragma once

#include "platform/OmcSimpleAssociationMI.h"

namespace TvLatchedHealth {

class TvLatchedHealthAssociation : public virtual OMC::SimpleAssociationMI {
public:
    TvLatchedHealthAssociation(const CmpiBroker &mb, const CmpiContext &ctx);
    ~TvLatchedHealthAssociation() override;

    // The filters are applied by the base class.
    CmpiStatus doReferences(const CmpiContext &ctx, CmpiResult &rslt, const CmpiObjectPath &op,
                            const char *assocClass, const char *resultClass, const char *role,
                            const char *resultRole) override;
    int isUnloadable() const override;
};

}  // namespace TvLatchedHealth

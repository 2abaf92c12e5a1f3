#include "platform/AcceptingIndicationMI.h"

namespace platform {

AcceptingIndicationMI::AcceptingIndicationMI(const CmpiBroker &mb, const CmpiContext &ctx)
    : CmpiBaseMI(mb, ctx), CmpiIndicationMI(mb, ctx) {}

CmpiStatus AcceptingIndicationMI::authorizeFilter(const CmpiContext &, const CmpiSelectExp &, const char *,
                                                  const CmpiObjectPath &, const char *) {
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus AcceptingIndicationMI::mustPoll(const CmpiContext &, const CmpiSelectExp &, const char *,
                                           const CmpiObjectPath &) {
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus AcceptingIndicationMI::activateFilter(const CmpiContext &, const CmpiSelectExp &, const char *,
                                                 const CmpiObjectPath &, bool) {
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus AcceptingIndicationMI::deActivateFilter(const CmpiContext &, const CmpiSelectExp &, const char *,
                                                   const CmpiObjectPath &, bool) {
    return CmpiStatus(CMPI_RC_OK);
}

CmpiStatus AcceptingIndicationMI::enableIndications(const CmpiContext &) { return CmpiStatus(CMPI_RC_OK); }

CmpiStatus AcceptingIndicationMI::disableIndications(const CmpiContext &) { return CmpiStatus(CMPI_RC_OK); }

}  // namespace platform

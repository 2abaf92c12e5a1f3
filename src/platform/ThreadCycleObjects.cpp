#include "platform/ThreadCycleObjects.h"

#include "cmpi/cmpi_context_ext.h"

namespace platform {

ThreadCycleObjects::ThreadCycleObjects(const CmpiBroker &, const CmpiContext &threadContext)
    : context(threadContext) {}

ThreadCycleObjects::~ThreadCycleObjects() = default;

void ThreadCycleObjects::release() {
    CMPIContext *ctx = context.getEnc();
    if (ctx == nullptr) return;
    reinterpret_cast<const CMPIContextExtFT *>(ctx->ft)->releaseThreadObjects(ctx);
}

}  // namespace platform

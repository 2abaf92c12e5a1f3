#include "platform/ThreadCycleObjects.h"

#include "cmpi/cmpi_context_ext.h"

namespace platform {

namespace {

const CMPIBrokerMemFT *markReleaseTable(const CMPIBroker *broker) {
    if (broker == nullptr) return nullptr;
    const CMPIBrokerMemFT *memory = broker->mft;
    return memory != nullptr && memory->mark != nullptr && memory->release != nullptr ? memory : nullptr;
}

}  // namespace

ThreadCycleObjects::ThreadCycleObjects(const CmpiBroker &broker, const CmpiContext &threadContext)
    : brokerHandle(broker.getEnc()),
      contextHandle(threadContext.getEnc()),
      markRelease(markReleaseTable(brokerHandle)) {
    if (markRelease == nullptr) return;
    CMPIStatus rc{CMPI_RC_OK, nullptr};
    mark = markRelease->mark(brokerHandle, &rc);
    // Without a mark there is nothing this cycle can give back.
    if (rc.rc != CMPI_RC_OK) ended = true;
}

ThreadCycleObjects::~ThreadCycleObjects() { release(); }

void ThreadCycleObjects::release() {
    if (ended) return;
    ended = true;
    if (markRelease != nullptr) {
        markRelease->release(brokerHandle, mark);
    } else if (contextHandle != nullptr && contextHandle->ft != nullptr) {
        reinterpret_cast<const CMPIContextExtFT *>(contextHandle->ft)->releaseThreadObjects(contextHandle);
    }
}

}  // namespace platform

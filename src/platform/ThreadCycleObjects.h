// PLACEHOLDER until the broker-mode branch lands.
#pragma once

#include "CmpiBroker.h"

namespace platform {

class ThreadCycleObjects {
public:
    ThreadCycleObjects(const CmpiBroker &broker, const CmpiContext &threadContext);
    ThreadCycleObjects(const ThreadCycleObjects &) = delete;
    ThreadCycleObjects &operator=(const ThreadCycleObjects &) = delete;
    ~ThreadCycleObjects();
    void release();

private:
    CmpiContext context;
};

}  // namespace platform

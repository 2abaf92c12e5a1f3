// What one cycle of a provider thread obtained from the broker, given back
// when the cycle ends. An attached thread's objects are the broker's until
// the thread gives them back, so a thread that runs for the broker's whole
// life must do so every cycle or grow without end. The two brokers the
// library meets take them back differently, and a provider cannot ask which
// it has:
// - the host's broker offers no memory table (its CMPIBroker's mft is null)
//   and has an eighth context entry, releaseThreadObjects, that frees what
//   the broker created for the thread since it attached or last released;
// - stock sfcb 1.3 has the seven published context entries only (calling an
//   eighth reads past its table and kills the provider process) and offers
//   the memory table's mark and release.
// The rule: a broker whose memory table is there with both mark and release
// is released with them; any other broker is taken to be the host's and gets
// the eighth context entry.
#pragma once

#include "CmpiBroker.h"

namespace platform {

class ThreadCycleObjects {
public:
    // Marks on a mark/release broker. `threadContext` is the context the
    // thread attached with.
    ThreadCycleObjects(const CmpiBroker &broker, const CmpiContext &threadContext);
    ThreadCycleObjects(const ThreadCycleObjects &) = delete;
    ThreadCycleObjects &operator=(const ThreadCycleObjects &) = delete;
    // A cycle not yet ended (one left by an exception) is ended here; never
    // throws.
    ~ThreadCycleObjects();

    // Ends the cycle: the eighth context entry on the host's broker, the
    // memory table's release of the mark on a mark/release broker. The
    // broker's status is ignored, as the broker gives no remedy. Ending a
    // cycle twice does nothing more.
    void release();

private:
    const CMPIBroker *brokerHandle;
    const CMPIContext *contextHandle;
    const CMPIBrokerMemFT *markRelease;  // null on the host's broker
    CMPIGcStat *mark = nullptr;
    bool ended = false;
};

}  // namespace platform

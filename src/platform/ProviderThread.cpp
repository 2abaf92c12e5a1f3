#include "platform/ProviderThread.h"

#include <limits>
#include <memory>
#include <vector>

#include "CmpiStatus.h"

namespace platform {

int startProviderThread(pthread_t &handle, ThreadEntry entry, const CmpiBroker &broker,
                        const CmpiContext &ctx) {
    auto start = std::make_unique<ThreadStartArgs>(ThreadStartArgs{broker, broker.prepareAttachThread(ctx)});
    const int error = pthread_create(&handle, nullptr, entry, start.get());
    if (error == 0) start.release();
    return error;
}

ThreadStartArgs attachProviderThread(void *startArgs) {
    std::unique_ptr<ThreadStartArgs> start(static_cast<ThreadStartArgs *>(startArgs));
    const ThreadStartArgs thread = *start;
    start.reset();
    try {
        thread.broker.attachThread(thread.context);
    } catch (const CmpiStatus &) {
        // An unattached thread still runs; should the broker then refuse
        // what it asks, each cycle reports that in its own way.
    }
    return thread;
}

timespec deadlineAfter(const timeval &now, int seconds) {
    constexpr time_t latest = std::numeric_limits<time_t>::max();
    timespec deadline{};
    deadline.tv_sec = now.tv_sec > latest - seconds ? latest : now.tv_sec + seconds;
    deadline.tv_nsec = static_cast<long>(now.tv_usec) * 1000;
    return deadline;
}

void waitOnePeriod(OMC::Condition &condition, OMC::Mutex &mutex, int seconds) {
    timeval now{};
    gettimeofday(&now, nullptr);
    condition.timedWait(mutex, deadlineAfter(now, seconds));
}

void stopProviderThreads(OMC::Mutex &mutex, OMC::Condition &condition, bool &stop,
                         const std::function<bool()> &threadsRunning,
                         std::initializer_list<const pthread_t *> threads) {
    std::vector<pthread_t> ending;
    {
        const OMC::MutexLock lock(mutex);
        stop = true;
        if (!threadsRunning()) return;
        condition.broadcast();
        for (const pthread_t *thread : threads) ending.push_back(*thread);
    }
    for (pthread_t thread : ending) pthread_join(thread, nullptr);
}

}  // namespace platform

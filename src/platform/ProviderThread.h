// The life of a provider's background thread, shared by every threaded
// subsystem: the provider's initialize starts it on a start record, the
// thread attaches itself to the broker and runs cycles under its
// subsystem's mutex with a timed wait on the subsystem's condition between
// them, and a terminating cleanup stops it through the subsystem's stop
// flag. Each subsystem keeps its own mutex, condition, flags and handles in
// static storage and says what a failure to start means for it.
#pragma once

#include <pthread.h>
#include <sys/time.h>

#include <ctime>
#include <functional>
#include <initializer_list>

#include "CmpiBroker.h"
#include "platform/OmcCondition.h"

// What a provider thread starts from; the thread owns it and releases it as
// soon as it has copied both members.
struct ThreadStartArgs {
    CmpiBroker broker;    // the provider's own broker
    CmpiContext context;  // prepared for the thread by CmpiBroker::prepareAttachThread
};

namespace platform {

using ThreadEntry = void *(*)(void *);

// Starts `entry` with default attributes on a start record holding `broker`
// and a context prepared from `ctx`. Returns pthread_create's result: 0
// when the thread runs (it then owns the record), an error number when it
// could not be created (the record is released). A broker that cannot
// prepare a context throws its CmpiStatus.
int startProviderThread(pthread_t &handle, ThreadEntry entry, const CmpiBroker &broker,
                        const CmpiContext &ctx);

// The thread's first step: takes the broker and context out of its start
// record, releases the record and attaches to the broker.
ThreadStartArgs attachProviderThread(void *startArgs);

// `seconds` (not negative) after `now`, to the microsecond; a time beyond what time_t holds
// becomes the last second it holds, so a long period never wraps into the
// past.
timespec deadlineAfter(const timeval &now, int seconds);

// The wait between two cycles. The caller holds `mutex`, which is released
// only during the wait. It ends at the time of day plus `seconds`, on a
// broadcast, or spuriously: callers test their stop flag after it.
void waitOnePeriod(OMC::Condition &condition, OMC::Mutex &mutex, int seconds);

// A terminating cleanup: sets `stop` under `mutex`; when `threadsRunning`
// (asked under the mutex) says threads are still in their loops, wakes them
// with a broadcast, releases the mutex and joins `threads` in the order
// given. Returns once they have ended.
void stopProviderThreads(OMC::Mutex &mutex, OMC::Condition &condition, bool &stop,
                         const std::function<bool()> &threadsRunning,
                         std::initializer_list<const pthread_t *> threads);

}  // namespace platform

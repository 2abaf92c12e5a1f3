#include "platform/OmcCondition.h"

#include <cerrno>

#include "platform/OmcPosixError.h"

namespace OMC {

Condition::Condition() {
    throwIfFailed(pthread_cond_init(&condition, nullptr), "pthread_cond_init");
}

Condition::~Condition() { pthread_cond_destroy(&condition); }

void Condition::wait(Mutex &mutex) {
    throwIfFailed(pthread_cond_wait(&condition, &mutex.mutex), "pthread_cond_wait");
}

bool Condition::timedWait(Mutex &mutex, const timespec &deadline) {
    const int error = pthread_cond_timedwait(&condition, &mutex.mutex, &deadline);
    if (error == ETIMEDOUT) return true;
    throwIfFailed(error, "pthread_cond_timedwait");
    return false;
}

void Condition::signal() { throwIfFailed(pthread_cond_signal(&condition), "pthread_cond_signal"); }

void Condition::broadcast() {
    throwIfFailed(pthread_cond_broadcast(&condition), "pthread_cond_broadcast");
}

}  // namespace OMC

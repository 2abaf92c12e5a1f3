#include "platform/OmcMutex.h"

#include "platform/OmcPosixError.h"

namespace OMC {

Mutex::Mutex() { throwIfFailed(pthread_mutex_init(&mutex, nullptr), "pthread_mutex_init"); }

Mutex::~Mutex() { pthread_mutex_destroy(&mutex); }

void Mutex::lock() { throwIfFailed(pthread_mutex_lock(&mutex), "pthread_mutex_lock"); }

void Mutex::unlock() noexcept { pthread_mutex_unlock(&mutex); }

}  // namespace OMC

// A POSIX mutex with default attributes, owned for its whole life by one
// object, and the guard that holds it for a scope.
#pragma once

#include <pthread.h>

namespace OMC {

class Condition;

class Mutex {
public:
    Mutex();  // throws std::system_error when the mutex cannot be created
    ~Mutex();
    Mutex(const Mutex &) = delete;
    Mutex &operator=(const Mutex &) = delete;

    void lock();  // throws std::system_error
    // Only the holder may call it; it cannot fail then, so guards may call
    // it from their destructors.
    void unlock() noexcept;

private:
    friend class Condition;

    pthread_mutex_t mutex;
};

class MutexLock {
public:
    explicit MutexLock(Mutex &mutex) : held(mutex) { held.lock(); }
    ~MutexLock() { held.unlock(); }
    MutexLock(const MutexLock &) = delete;
    MutexLock &operator=(const MutexLock &) = delete;

private:
    Mutex &held;
};

}  // namespace OMC

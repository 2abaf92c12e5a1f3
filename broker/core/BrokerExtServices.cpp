// The operating-system services of the broker, over POSIX threads.
#include <pthread.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <string>

#include "core/BrokerState.h"

namespace tvxbroker {

namespace {

char *resolveFileName(const char *filename) {
    if (filename == nullptr) return nullptr;
    return strdup(("lib" + std::string(filename) + ".so").c_str());
}

void *newThread(void *(*start)(void *), void *parm, int detached) {
    auto *thread = new pthread_t;
    if (pthread_create(thread, nullptr, start, parm) != 0) {
        delete thread;
        return nullptr;
    }
    if (detached != 0) {
        pthread_detach(*thread);
        delete thread;
        return nullptr;
    }
    return thread;
}

int joinThread(void *thread, void **retval) {
    if (thread == nullptr) return EINVAL;
    auto *handle = static_cast<pthread_t *>(thread);
    const int rc = pthread_join(*handle, retval);
    delete handle;
    return rc;
}

int exitThread(void *retval) { pthread_exit(retval); }

int cancelThread(void *thread) {
    return thread == nullptr ? EINVAL : pthread_cancel(*static_cast<pthread_t *>(thread));
}

int threadSleep(CMPIUint32 msec) { return usleep(static_cast<useconds_t>(msec) * 1000u); }

int threadOnce(int *once, void (*init)(void)) {
    // The caller's flag starts at zero; a mutex makes the first call win.
    static pthread_mutex_t onceMutex = PTHREAD_MUTEX_INITIALIZER;
    pthread_mutex_lock(&onceMutex);
    if (*once == 0) {
        *once = 1;
        init();
    }
    pthread_mutex_unlock(&onceMutex);
    return 0;
}

int createThreadKey(CMPI_THREAD_KEY_TYPE *key, void (*cleanup)(void *)) {
    pthread_key_t created;
    const int rc = pthread_key_create(&created, cleanup);
    if (rc == 0) *key = static_cast<CMPI_THREAD_KEY_TYPE>(created);
    return rc;
}

int destroyThreadKey(CMPI_THREAD_KEY_TYPE key) { return pthread_key_delete(key); }

void *getThreadSpecific(CMPI_THREAD_KEY_TYPE key) { return pthread_getspecific(key); }

int setThreadSpecific(CMPI_THREAD_KEY_TYPE key, void *value) {
    return pthread_setspecific(key, value);
}

void *newMutex(int) {
    auto *mutex = new pthread_mutex_t;
    pthread_mutex_init(mutex, nullptr);
    return mutex;
}

void destroyMutex(void *mutex) {
    if (mutex == nullptr) return;
    pthread_mutex_destroy(static_cast<pthread_mutex_t *>(mutex));
    delete static_cast<pthread_mutex_t *>(mutex);
}

void lockMutex(void *mutex) { pthread_mutex_lock(static_cast<pthread_mutex_t *>(mutex)); }

void unlockMutex(void *mutex) { pthread_mutex_unlock(static_cast<pthread_mutex_t *>(mutex)); }

void *newCondition(int) {
    auto *cond = new pthread_cond_t;
    pthread_cond_init(cond, nullptr);
    return cond;
}

void destroyCondition(void *cond) {
    if (cond == nullptr) return;
    pthread_cond_destroy(static_cast<pthread_cond_t *>(cond));
    delete static_cast<pthread_cond_t *>(cond);
}

int condWait(void *cond, void *mutex) {
    return pthread_cond_wait(static_cast<pthread_cond_t *>(cond),
                             static_cast<pthread_mutex_t *>(mutex));
}

int timedCondWait(void *cond, void *mutex, struct timespec *wait) {
    return pthread_cond_timedwait(static_cast<pthread_cond_t *>(cond),
                                  static_cast<pthread_mutex_t *>(mutex), wait);
}

int signalCondition(void *cond) { return pthread_cond_signal(static_cast<pthread_cond_t *>(cond)); }

}  // namespace

const CMPIBrokerExtFT brokerExtFT = {
    CMPICurrentVersion, resolveFileName, newThread,        joinThread,        exitThread,
    cancelThread,       threadSleep,     threadOnce,       createThreadKey,   destroyThreadKey,
    getThreadSpecific,  setThreadSpecific, newMutex,       destroyMutex,      lockMutex,
    unlockMutex,        newCondition,    destroyCondition, condWait,          timedCondWait,
    signalCondition};

}  // namespace tvxbroker

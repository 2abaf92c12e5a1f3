// Ownership of the objects the broker creates for providers. Every object
// lands in the pool current on the creating thread: a request's pool (freed
// when the request ends), an attached thread's pool (freed by
// releaseThreadObjects and detachThread) or, for a thread that never
// attached, the process pool (freed at shutdown).
#pragma once

#include <atomic>
#include <cstddef>
#include <memory>
#include <mutex>
#include <unordered_map>

namespace tvxbroker {

class ObjectPool;

class PooledObject {
public:
    virtual ~PooledObject() = default;
    ObjectPool *pool = nullptr;  // null for clones, which their holder releases
};

class ObjectPool {
public:
    ObjectPool() = default;
    ObjectPool(const ObjectPool &) = delete;
    ObjectPool &operator=(const ObjectPool &) = delete;
    ~ObjectPool() { releaseAll(); }

    void adopt(std::unique_ptr<PooledObject> object);
    // Frees one object now (a provider's explicit release).
    void release(PooledObject *object);
    void releaseAll();
    std::size_t size() const;

    // The pool new objects go to on this thread.
    static ObjectPool &current();
    static void setCurrent(ObjectPool *pool);
    static ObjectPool *currentOrNull();
    static ObjectPool &processPool();
    // Objects alive in all pools of the process.
    static std::size_t liveCount() { return live.load(); }

private:
    mutable std::mutex mutex;
    std::unordered_map<PooledObject *, std::unique_ptr<PooledObject>> objects;
    static std::atomic<std::size_t> live;
};

// Makes a fresh pool current for the lifetime of a request, restoring the
// previous one (an up-call nests inside its caller's request).
class RequestScope {
public:
    RequestScope() : previous(ObjectPool::currentOrNull()) { ObjectPool::setCurrent(&pool); }
    RequestScope(const RequestScope &) = delete;
    RequestScope &operator=(const RequestScope &) = delete;
    ~RequestScope() { ObjectPool::setCurrent(previous); }

private:
    ObjectPool *previous;
    ObjectPool pool;
};

}  // namespace tvxbroker

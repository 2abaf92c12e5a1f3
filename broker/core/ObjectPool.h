// Ownership of the objects the broker creates for providers. Every object
// lands in the pool current on the creating thread: a request's pool (freed
// when the request ends), an attached thread's pool (freed by
// releaseThreadObjects and detachThread) or, for a thread that never
// attached, the process pool (freed at shutdown). A pool numbers what it
// adopts, so a memory mark can free exactly what came after it.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <mutex>

namespace tvxbroker {

class ObjectPool;

class PooledObject {
public:
    virtual ~PooledObject() = default;
    ObjectPool *pool = nullptr;  // null for clones, which their holder releases
    std::uint64_t sequence = 0;  // order of adoption within the pool
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
    // Frees every object adopted at or after `sequence`.
    void releaseFrom(std::uint64_t sequence);
    void releaseAll() { releaseFrom(0); }
    std::size_t size() const;
    // How many times releaseFrom ran: for a thread's pool, the cycles the
    // thread has ended.
    std::uint64_t releaseCount() const { return releases.load(); }

    // The pool new objects go to on this thread.
    static ObjectPool &current();
    static void setCurrent(ObjectPool *pool);
    static ObjectPool *currentOrNull();
    static ObjectPool &processPool();
    // Objects alive in all pools of the process.
    static std::size_t liveCount() { return live.load(); }

private:
    mutable std::mutex mutex;
    std::map<std::uint64_t, std::unique_ptr<PooledObject>> objects;  // by sequence
    std::uint64_t nextSequence = 0;
    std::atomic<std::uint64_t> releases{0};
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

#include "core/ObjectPool.h"

namespace tvxbroker {

std::atomic<std::size_t> ObjectPool::live{0};

namespace {
thread_local ObjectPool *currentPool = nullptr;
}

void ObjectPool::adopt(std::unique_ptr<PooledObject> object) {
    object->pool = this;
    std::lock_guard<std::mutex> lock(mutex);
    object->sequence = nextSequence++;
    objects.emplace(object->sequence, std::move(object));
    ++live;
}

void ObjectPool::release(PooledObject *object) {
    std::unique_ptr<PooledObject> owned;
    {
        std::lock_guard<std::mutex> lock(mutex);
        auto found = objects.find(object->sequence);
        if (found == objects.end() || found->second.get() != object) return;
        owned = std::move(found->second);
        objects.erase(found);
    }
    --live;
}

void ObjectPool::releaseFrom(std::uint64_t sequence) {
    std::map<std::uint64_t, std::unique_ptr<PooledObject>> doomed;
    {
        std::lock_guard<std::mutex> lock(mutex);
        for (auto it = objects.lower_bound(sequence); it != objects.end();) doomed.insert(objects.extract(it++));
    }
    live -= doomed.size();
    ++releases;
}

std::size_t ObjectPool::size() const {
    std::lock_guard<std::mutex> lock(mutex);
    return objects.size();
}

ObjectPool &ObjectPool::current() { return currentPool != nullptr ? *currentPool : processPool(); }

void ObjectPool::setCurrent(ObjectPool *pool) { currentPool = pool; }

ObjectPool *ObjectPool::currentOrNull() { return currentPool; }

ObjectPool &ObjectPool::processPool() {
    static ObjectPool pool;
    return pool;
}

}  // namespace tvxbroker

#include "core/PoolMark.h"

#include <mutex>
#include <unordered_set>

namespace tvxbroker {

namespace {

std::mutex liveMarksMutex;
std::unordered_set<const void *> liveMarks;

}  // namespace

PoolMark::PoolMark() {
    const std::lock_guard<std::mutex> lock(liveMarksMutex);
    liveMarks.insert(this);
}

PoolMark::~PoolMark() {
    const std::lock_guard<std::mutex> lock(liveMarksMutex);
    liveMarks.erase(this);
}

PoolMark *PoolMark::placeInCurrentPool() {
    std::unique_ptr<PoolMark> mark(new PoolMark);
    PoolMark *raw = mark.get();
    ObjectPool::current().adopt(std::move(mark));
    return raw;
}

bool PoolMark::release(const void *handle) {
    ObjectPool *pool = nullptr;
    std::uint64_t from = 0;
    {
        // Taken out of the live set at once, so a second release of the
        // same mark is refused even before the pool has freed it.
        const std::lock_guard<std::mutex> lock(liveMarksMutex);
        const auto found = liveMarks.find(handle);
        if (found == liveMarks.end()) return false;
        const auto *mark = static_cast<const PoolMark *>(*found);
        pool = mark->pool;
        from = mark->sequence;
        liveMarks.erase(found);
    }
    pool->releaseFrom(from);
    return true;
}

}  // namespace tvxbroker

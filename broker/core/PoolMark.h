// A position in an object pool, as the memory table's mark hands it to a
// provider: releasing it frees every object the pool adopted from the mark
// on, the mark itself included. A mark lives in the pool it was taken in,
// so one never released goes when its pool does. Live marks are known by
// address, so a handle that is none is refused without being read.
#pragma once

#include "core/ObjectPool.h"

namespace tvxbroker {

class PoolMark : public PooledObject {
public:
    PoolMark(const PoolMark &) = delete;
    PoolMark &operator=(const PoolMark &) = delete;
    ~PoolMark() override;

    // A new mark at the end of the calling thread's current pool.
    static PoolMark *placeInCurrentPool();
    // Frees what the pool adopted since the mark at `handle`; false when
    // `handle` is no live mark.
    static bool release(const void *handle);

private:
    PoolMark();
};

}  // namespace tvxbroker

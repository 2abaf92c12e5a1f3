// The heartbeat thread: from its start until a terminating cleanup it
// sends a heartbeat, then waits one period.
#pragma once

namespace Heartbeat {

// A POSIX thread start routine; `startArgs` is a ThreadStartArgs the thread
// owns. Returns null.
void *heartBeatThread(void *startArgs);

}  // namespace Heartbeat

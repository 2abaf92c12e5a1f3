// The Ostrakon user library: where the process runs and which host it is.
#pragma once

extern "C" {

// Sets *inCos non-zero when the process runs in the service console rather
// than directly on the Ostrakon kernel.
int OskuserCompat_InCOS(int *inCos);

// True on a host that runs the Ostrakon kernel alone, false on a host with a
// service console.
int HostType_OSIsOSK(void);

}

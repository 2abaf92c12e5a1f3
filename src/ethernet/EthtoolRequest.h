// The one place the ethtool request reaches the kernel, so tests can stand
// in for a driver.
#pragma once

struct ifreq;

namespace EthernetProvider {

// Same contract as ioctl: negative on failure.
using EthtoolRequest = int (*)(int fd, ifreq *request);

int issueEthtoolRequest(int fd, ifreq *request);

// Returns the request in use before.
EthtoolRequest replaceEthtoolRequest(EthtoolRequest replacement);

}  // namespace EthernetProvider

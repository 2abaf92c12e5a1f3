#include "ethernet/EthtoolRequest.h"

#include <linux/sockios.h>
#include <net/if.h>
#include <sys/ioctl.h>

#include <atomic>

namespace EthernetProvider {
namespace {

int kernelEthtoolRequest(int fd, ifreq *request) { return ::ioctl(fd, SIOCETHTOOL, request); }

std::atomic<EthtoolRequest> currentRequest{kernelEthtoolRequest};

}  // namespace

int issueEthtoolRequest(int fd, ifreq *request) { return currentRequest.load()(fd, request); }

EthtoolRequest replaceEthtoolRequest(EthtoolRequest replacement) {
    return currentRequest.exchange(replacement != nullptr ? replacement : kernelEthtoolRequest);
}

}  // namespace EthernetProvider

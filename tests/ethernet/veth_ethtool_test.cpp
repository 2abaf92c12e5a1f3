// In the service console the ethtool request is a real one on an IPv4
// socket: asked of a veth pair inside a private network namespace, the
// inventory must report what the kernel's veth driver reports.
#include <linux/ethtool.h>
#include <linux/sockios.h>
#include <net/if.h>
#include <sched.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include "ethernet/GetPnicDetails.h"
#include "ethernet/LinkSettings.h"
#include "hostsim/HostSimControl.h"

namespace EthernetProvider {
namespace {

constexpr const char *kVeth = "tvxveth0";

struct Outcome {
    std::string skipped;
    int requestErrno = 0;  // of the test's own request, 0 when the kernel answered it
    ethtool_cmd reported{};
    std::vector<PnicDetails> pnics;
    unsigned int result = 1;
};

// Runs on its own thread: the namespace belongs to that thread alone, and the
// veth pair disappears with it.
void inPrivateNamespace(Outcome &outcome) {
    if (::unshare(CLONE_NEWNET) != 0) {
        outcome.skipped = std::string("cannot make a network namespace: ") + std::strerror(errno);
        return;
    }
    const std::string command = std::string("ip link add ") + kVeth +
                                " type veth peer name tvxveth1 && ip link set " + kVeth + " up";
    if (std::system(command.c_str()) != 0) {
        outcome.skipped = "cannot create a veth pair with ip(8)";
        return;
    }
    const int fd = ::socket(AF_INET, SOCK_DGRAM, 0);
    ifreq request{};
    std::strncpy(request.ifr_name, kVeth, IFNAMSIZ - 1);
    outcome.reported.cmd = ETHTOOL_GSET;
    request.ifr_data = reinterpret_cast<char *>(&outcome.reported);
    outcome.requestErrno = fd >= 0 && ::ioctl(fd, SIOCETHTOOL, &request) == 0 ? 0 : errno;
    if (fd >= 0) ::close(fd);
    outcome.result = getPnicDetails(outcome.pnics);
}

TEST(ServiceConsoleEthtool, RealVethReportsItsLinkSettings) {
    if (::geteuid() != 0) GTEST_SKIP() << "needs root to create a network namespace and a veth pair";
    const std::string profile = std::string(R"({"hostType": "Corla", "adapters": [{"name": ")") + kVeth +
                                R"(", "mac": "02:00:00:00:00:09"}]})";
    char error[256];
    ASSERT_EQ(HostSim_LoadProfileText(profile.c_str(), error, sizeof error), 0) << error;

    Outcome outcome;
    std::thread([&outcome] { inPrivateNamespace(outcome); }).join();
    HostSim_ResetProfile();
    if (!outcome.skipped.empty()) GTEST_SKIP() << outcome.skipped;

    // qemu-user passes the request on untranslated for a 32-bit process, so
    // under emulation the kernel cannot be asked at all.
    if (outcome.requestErrno != 0) {
        GTEST_SKIP() << "ETHTOOL_GSET cannot be issued from this process ("
                     << std::strerror(outcome.requestErrno) << "); an emulated 32-bit run cannot ask the kernel";
    }
    ASSERT_EQ(outcome.result, 0u);
    ASSERT_EQ(outcome.pnics.size(), 1u);
    EXPECT_EQ(outcome.pnics[0].portType, portTypeFor(outcome.reported.port, outcome.reported.speed))
        << "veth reports port " << int(outcome.reported.port) << ", " << outcome.reported.speed << " Mb/s";
    EXPECT_EQ(outcome.pnics[0].autoSense, (outcome.reported.supported & SUPPORTED_Autoneg) ? 1 : 0);
}

}  // namespace
}  // namespace EthernetProvider

// The detector on the kernel's own interface-address list: in a private
// network namespace, an address of a veth replaced with ip(8) between two
// reads gives exactly one indication, carrying the old and the new address.
#include <gtest/gtest.h>
#include <ifaddrs.h>
#include <sched.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <string>
#include <thread>

#include "DetectionBroker.h"
#include "SyslogCapture.h"
#include "kernelip/KernelIpIndication.h"

namespace kipdtest {
namespace {

constexpr const char *kVeth = "tvxkip0";

struct Replacement {
    int family;
    const char *before;  // "address/prefix"
    const char *after;
    const char *indication;
};

bool run(const std::string &command) { return std::system(command.c_str()) == 0; }

// Why getifaddrs in this process cannot be used here, if it cannot: it
// must list an address of `family` on the veth, and under an emulator its
// netlink answer may not come through.
std::string unusableReason(int family) {
    ifaddrs *list = nullptr;
    if (getifaddrs(&list) != 0) return std::string("getifaddrs fails here: ") + std::strerror(errno);
    bool listed = false;
    for (const ifaddrs *entry = list; entry != nullptr; entry = entry->ifa_next) {
        listed = listed || (entry->ifa_addr != nullptr && entry->ifa_addr->sa_family == family &&
                            std::strcmp(entry->ifa_name, kVeth) == 0);
    }
    freeifaddrs(list);
    return listed ? "" : "getifaddrs does not list the veth's address in this process";
}

// Runs on its own thread: the namespace belongs to that thread alone, and
// the veth pair disappears with it. The veth stays down, so that no
// link-local address comes up between the reads; nodad makes an IPv6
// address usable at once. Gives why the test cannot run here, if it cannot.
std::string inPrivateNamespace(const Replacement &change, std::vector<std::string> &summaries) {
    if (::unshare(CLONE_NEWNET) != 0) return std::string("cannot make a network namespace: ") + std::strerror(errno);
    const bool v6 = change.family == AF_INET6;
    const std::string ip = v6 ? "ip -6 addr " : "ip -4 addr ";
    const std::string device = std::string(" dev ") + kVeth + (v6 ? " nodad" : "");
    if (!run(std::string("ip link add ") + kVeth + " type veth peer name tvxkip1 && " + ip + "add " +
             change.before + device)) {
        return "cannot create a veth pair with an address with ip(8)";
    }
    const std::string unusable = unusableReason(change.family);
    if (!unusable.empty()) return unusable;

    DetectionBroker broker;
    TVX::KernelIpIndication detector;
    detector.enableIndication();
    EXPECT_TRUE(run(ip + "del " + change.before + device + " && " + ip + "add " + change.after + device));
    detector.testAndSend(broker.context(), broker.broker());
    summaries = broker.takeSummaries();
    return "";
}

TEST(RealAddressChange, ReplacingAVethAddressGivesOneIndication) {
    if (::geteuid() != 0) GTEST_SKIP() << "needs root to create a network namespace and a veth pair";
    const Replacement changes[] = {
        {AF_INET, "10.9.8.1/24", "10.9.8.2/24", "Talvex:tvxkip0 10.9.8.1/255.255.255.0 -> 10.9.8.2/255.255.255.0"},
        {AF_INET6, "fd00:9::1/64", "fd00:9::2/64", "Talvex:tvxkip0 fd00:9::1/64 -> fd00:9::2/64"},
    };
    for (const Replacement &change : changes) {
        SCOPED_TRACE(change.indication);
        syslogcapture::takeLoggedLines();
        std::string skipped;
        std::vector<std::string> summaries;
        std::thread([&] { skipped = inPrivateNamespace(change, summaries); }).join();
        if (!skipped.empty()) GTEST_SKIP() << skipped;
        EXPECT_EQ(summaries, std::vector<std::string>{change.indication});
        EXPECT_EQ(syslogcapture::takeLoggedLines(), std::vector<syslogcapture::LoggedLine>{});
    }
}

}  // namespace
}  // namespace kipdtest

// The change detector over scripted interface-address lists: which
// replacements become indications and in what order, what a disabled
// detector reports, failures of the list and of delivery, and the
// indication as the broker receives it.
#include <gtest/gtest.h>
#include <syslog.h>

#include <cerrno>
#include <cstring>
#include <ctime>

#include "DetectionBroker.h"
#include "ScriptedInterfaceAddresses.h"
#include "SyslogCapture.h"
#include "kernelip/KernelIpIndication.h"
#include "platform/OmcComputerSystem.h"

namespace kipdtest {
namespace {

using syslogcapture::LoggedLine;
using syslogcapture::takeLoggedLines;
using Lines = std::vector<std::string>;

const Lines kChange{"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"};

class Detection : public testing::Test {
protected:
    void SetUp() override { takeLoggedLines(); }
    void TearDown() override { EXPECT_EQ(addresses.unreleased(), 0); }

    // Reads `before` as the baseline, then shows `after` to the cycles.
    void enableOver(const EntryList &before, const EntryList &after) {
        addresses.show(before);
        detector.enableIndication();
        addresses.show(after);
    }
    void cycle() { detector.testAndSend(broker.context(), broker.broker()); }

    DetectionBroker broker;
    ScriptedInterfaceAddresses addresses;
    TVX::KernelIpIndication detector{addresses};
};

TEST_F(Detection, ReportsEachGoneAddressOfTheSameFamilyForEachNewAddress) {
    const Entry linkLayer{"eth0", AF_PACKET, "bare", "bare"};
    const struct {
        const char *what;
        EntryList before, after;
        Lines indications;
    } cases[] = {
        {"replaced address", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.2")}, kChange},
        {"netmask changed", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.1", "255.255.0.0")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.1/255.255.0.0"}},
        {"IPv6 prefix changed", {ipv6("eth0", "fd00::1")}, {ipv6("eth0", "fd00::1", "ffff:ffff:ffff::")}, {}},
        {"two replaced by two: new ones in list order, gone ones in their order; a mask that is no run of ones "
         "is prefix 0",
         {ipv6("eth0", "fd00::1"), ipv6("eth0", "fd00::2")},
         {ipv6("eth0", "fd00::4", "ff00:ff00::"), ipv6("eth0", "fd00::3")},
         {"Talvex:eth0 fd00::1/64 -> fd00::4/0", "Talvex:eth0 fd00::2/64 -> fd00::4/0",
          "Talvex:eth0 fd00::1/64 -> fd00::3/64", "Talvex:eth0 fd00::2/64 -> fd00::3/64"}},
        {"one of two replaced: the one kept is no replacement",
         {ipv4("eth0", "10.0.0.1"), ipv4("eth0", "10.0.0.3")}, {ipv4("eth0", "10.0.0.3"), ipv4("eth0", "10.0.0.2")},
         kChange},
        {"entries without a usable address are skipped",
         {linkLayer, ipv4("eth0", "", ""), ipv4("eth0", "10.0.0.1"), ipv6("eth0", "fd00::9", "")},
         {linkLayer, ipv4("eth0", "", ""), ipv6("eth0", "fd00::8", ""), ipv4("eth0", "10.0.0.2", ""),
          ipv4("eth0", "10.0.0.2")},
         kChange},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(c.what);
        ScriptedInterfaceAddresses source;
        TVX::KernelIpIndication fresh(source);
        source.show(c.before);
        fresh.enableIndication();
        source.show(c.after);
        fresh.testAndSend(broker.context(), broker.broker());
        EXPECT_EQ(broker.takeSummaries(), c.indications);
        fresh.testAndSend(broker.context(), broker.broker());
        EXPECT_EQ(broker.takeSummaries(), Lines{}) << "the change is the new baseline";
        EXPECT_EQ(source.unreleased(), 0);
    }
    EXPECT_EQ(takeLoggedLines(), std::vector<LoggedLine>{});
}

TEST_F(Detection, ReportsNothingWhileDisabledAndThenWhatChangedMeanwhile) {
    addresses.show({ipv4("eth0", "10.0.0.1")});
    detector.enableIndication();
    detector.disableIndication();
    addresses.show({ipv4("eth0", "10.0.0.2")});
    cycle();
    EXPECT_TRUE(broker.takeSummaries().empty());
    detector.enableIndication();
    cycle();
    EXPECT_EQ(broker.takeSummaries(), kChange) << "the baseline from before the disable is kept";
}

// Only the baseline's read fails: the old baseline stays, so the change is
// found again on the next cycle.
TEST_F(Detection, AFailedReadIsLoggedAndKeepsWhatWasReadBefore) {
    enableOver({ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.2")});
    addresses.failOneRead(ENOMEM, 1);
    cycle();
    EXPECT_EQ(broker.takeSummaries(), kChange);
    const std::string refreshFailed = "Unable to refresh network interface information of the system, Error: ";
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, refreshFailed + std::strerror(ENOMEM) + "\n"}}));
    cycle();
    EXPECT_EQ(broker.takeSummaries(), kChange);
    cycle();
    EXPECT_TRUE(broker.takeSummaries().empty());
}

TEST_F(Detection, ARefusedDeliveryIsLoggedWithItsCodeAndTheRestAreStillSent) {
    enableOver({ipv6("vmk0", "fd00::1", "ffff:fe00::"), ipv4("vmk1", "10.0.0.1")},
               {ipv6("vmk0", "fd00::3"), ipv4("vmk1", "10.0.0.2")});
    broker.refuseNext(1);
    cycle();
    EXPECT_EQ(broker.takeSummaries(), (Lines{"Talvex:vmk0 fd00::1/23 -> fd00::3/64",
                                             "Talvex:vmk1 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"}));
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{{LOG_ERR, "Failed to deliver indication " +
                                                                        std::to_string(CMPI_RC_ERR_FAILED) + "\n"}}));
}

// The embedded endpoints are read in every summary; here the rest of what
// a listener receives.
TEST_F(Detection, IndicationCarriesTheSourcesPathHostAndTime) {
    const std::string host = OMC::getComputerSystemName(broker.context(), broker.broker());
    enableOver({ipv6("vmk1", "fd00::1")}, {ipv6("vmk1", "fd00:0::a:2")});
    const std::uint64_t earliest = std::time(nullptr);
    cycle();
    const std::uint64_t latest = std::time(nullptr);
    const std::vector<tvxbroker::Instance> delivered = broker.takeDelivered();
    ASSERT_EQ(delivered.size(), 1u) << "to " << kNs;
    const tvxbroker::Instance &event = delivered[0];
    EXPECT_EQ(event.path.className, "Talvex_KernelIPChangedIndication");
    EXPECT_EQ(valueOf(event, "PerceivedSeverity"), "3");
    EXPECT_EQ(valueOf(event, "SourceInstanceModelPath"),
              "root/cimv2:Talvex_KernelIPv6ProtocolEndpoint.SystemCreationClassName=\"OMC_UnitaryComputerSystem\","
              "SystemName=\"" + host + "\",CreationClassName=\"Talvex_KernelIPv6ProtocolEndpoint\",Name=\"vmk1\"");
    EXPECT_EQ(valueOf(event, "SourceInstanceHost"), "fd00::a:2");
    const tvxbroker::DateTime time = event.property("IndicationTime")->dateTime;
    EXPECT_FALSE(time.interval);
    EXPECT_EQ(time.microseconds % 1000000u, 0u) << "whole seconds";
    EXPECT_GE(time.microseconds / 1000000u, earliest);
    EXPECT_LE(time.microseconds / 1000000u, latest);
}

}  // namespace
}  // namespace kipdtest

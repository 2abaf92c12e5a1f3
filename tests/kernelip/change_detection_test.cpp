// The change detector over scripted interface-address lists: which
// replacements become indications and in what order, what a disabled
// detector reads, failures of the list and of delivery, and the
// indication as the broker receives it.
#include <gtest/gtest.h>
#include <syslog.h>

#include <algorithm>
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

class Detection : public testing::Test {
protected:
    void SetUp() override { takeLoggedLines(); }

    void cycle() { detector.testAndSend(thread.context, broker.broker()); }

    DetectionBroker broker;
    AttachedThread thread{broker};
    ScriptedInterfaceAddresses addresses;
    TVX::KernelIpIndication detector{addresses};
};

TEST(ChangeDetection, ReportsEachGoneAddressOfTheSameFamilyForEachNewAddress) {
    const Entry linkLayer{"eth0", AF_PACKET, "bare", "bare"};
    const struct {
        const char *what;
        EntryList before, after;
        std::vector<std::string> indications;
    } cases[] = {
        {"replaced address", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.2")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"}},
        {"netmask changed", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.1", "255.255.0.0")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.1/255.255.0.0"}},
        {"IPv6 prefix changed", {ipv6("eth0", "fd00::1")}, {ipv6("eth0", "fd00::1", "ffff:ffff:ffff::")}, {}},
        {"added only", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.1"), ipv4("eth0", "10.0.0.2")}, {}},
        {"removed only", {ipv4("eth0", "10.0.0.1"), ipv4("eth0", "10.0.0.2")}, {ipv4("eth0", "10.0.0.2")}, {}},
        {"two replaced by two: new ones in list order, gone ones in their order",
         {ipv6("eth0", "fd00::1"), ipv6("eth0", "fd00::2")},
         {ipv6("eth0", "fd00::4"), ipv6("eth0", "fd00::3")},
         {"Talvex:eth0 fd00::1/64 -> fd00::4/64", "Talvex:eth0 fd00::2/64 -> fd00::4/64",
          "Talvex:eth0 fd00::1/64 -> fd00::3/64", "Talvex:eth0 fd00::2/64 -> fd00::3/64"}},
        {"one of two replaced: the one kept is no replacement",
         {ipv4("eth0", "10.0.0.1"), ipv4("eth0", "10.0.0.2")},
         {ipv4("eth0", "10.0.0.2"), ipv4("eth0", "10.0.0.3")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.3/255.255.255.0"}},
        {"mixed families, IPv4 replaced", {ipv4("eth0", "10.0.0.1"), ipv6("eth0", "fd00::1")},
         {ipv6("eth0", "fd00::1"), ipv4("eth0", "10.0.0.2")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"}},
        {"IPv4 gone, IPv6 come", {ipv4("eth0", "10.0.0.1")}, {ipv6("eth0", "fd00::1")}, {}},
        {"interfaces in name order, not list order",
         {ipv4("eth1", "10.0.1.1"), ipv4("eth0", "10.0.0.1")},
         {ipv4("eth1", "10.0.1.2"), ipv4("eth0", "10.0.0.2")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0",
          "Talvex:eth1 10.0.1.1/255.255.255.0 -> 10.0.1.2/255.255.255.0"}},
        {"new interface", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth0", "10.0.0.1"), ipv4("eth1", "10.0.0.2")}, {}},
        {"vanished interface", {ipv4("eth0", "10.0.0.1"), ipv4("eth1", "10.0.0.2")}, {ipv4("eth1", "10.0.0.2")}, {}},
        {"address moved to another interface", {ipv4("eth0", "10.0.0.1")}, {ipv4("eth1", "10.0.0.1")}, {}},
        {"entries without a usable address are skipped",
         {linkLayer, ipv4("eth0", "", ""), ipv4("eth0", "10.0.0.1"), ipv6("eth0", "fd00::9", "")},
         {linkLayer, ipv4("eth0", "", ""), ipv6("eth0", "fd00::8", ""), ipv4("eth0", "10.0.0.2", ""),
          ipv4("eth0", "10.0.0.2")},
         {"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"}},
        {"nothing at all", {}, {}, {}},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(c.what);
        DetectionBroker broker;
        const AttachedThread thread(broker);
        ScriptedInterfaceAddresses addresses;
        TVX::KernelIpIndication detector(addresses);
        takeLoggedLines();
        addresses.show(c.before);
        detector.enableIndication();
        addresses.show(c.after);
        detector.testAndSend(thread.context, broker.broker());
        EXPECT_EQ(summaries(broker.takeDelivered()), c.indications);
        detector.testAndSend(thread.context, broker.broker());
        EXPECT_EQ(summaries(broker.takeDelivered()), std::vector<std::string>{}) << "the change is the new baseline";
        EXPECT_EQ(addresses.readCount(), 6);
        EXPECT_EQ(addresses.unreleased(), 0);
        EXPECT_EQ(takeLoggedLines(), std::vector<LoggedLine>{});
    }
}

TEST_F(Detection, ReadsNothingWhileDisabledAndThenReportsWhatChangedMeanwhile) {
    addresses.show({ipv4("eth0", "10.0.0.1")});
    cycle();
    EXPECT_EQ(addresses.readCount(), 0) << "never enabled";
    EXPECT_FALSE(detector.isEnabled());

    detector.enableIndication();
    EXPECT_TRUE(detector.isEnabled());
    EXPECT_EQ(addresses.readCount(), 2) << "the current state and the baseline";
    cycle();
    EXPECT_EQ(addresses.readCount(), 4);

    detector.disableIndication();
    EXPECT_FALSE(detector.isEnabled());
    addresses.show({ipv4("eth0", "10.0.0.2")});
    cycle();
    cycle();
    EXPECT_EQ(addresses.readCount(), 4) << "disabled";
    EXPECT_TRUE(broker.takeDelivered().empty());

    detector.enableIndication();
    EXPECT_EQ(addresses.readCount(), 5) << "the baseline from before the disable is kept";
    cycle();
    EXPECT_EQ(summaries(broker.takeDelivered()),
              std::vector<std::string>{"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"});
    EXPECT_EQ(addresses.unreleased(), 0);
    EXPECT_EQ(takeLoggedLines(), std::vector<LoggedLine>{});
}

TEST_F(Detection, AFailedReadIsLoggedAndKeepsWhatWasReadBefore) {
    const LoggedLine unreadable{
        LOG_ERR, std::string("Unable to refresh network interface information of the system, Error: ") +
                     std::strerror(ENOMEM) + "\n"};
    const std::vector<std::string> change{"Talvex:eth0 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"};
    addresses.show({ipv4("eth0", "10.0.0.1")});
    detector.enableIndication();
    addresses.show({ipv4("eth0", "10.0.0.2")});

    // Both reads of a cycle fail: the old current state is compared with
    // the old baseline.
    addresses.failReads(ENOMEM, 2);
    cycle();
    EXPECT_TRUE(broker.takeDelivered().empty());
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{unreadable, unreadable}));

    // Only the baseline's read fails: the change is found, and found again.
    addresses.failReads(ENOMEM, 1, 1);
    cycle();
    EXPECT_EQ(summaries(broker.takeDelivered()), change);
    EXPECT_EQ(takeLoggedLines(), std::vector<LoggedLine>{unreadable});
    cycle();
    EXPECT_EQ(summaries(broker.takeDelivered()), change);
    cycle();
    EXPECT_TRUE(broker.takeDelivered().empty());
    EXPECT_EQ(addresses.readCount(), 10);
    EXPECT_EQ(addresses.unreleased(), 0);
}

TEST_F(Detection, ARefusedDeliveryIsLoggedWithItsCodeAndTheRestAreStillSent) {
    addresses.show({ipv6("vmk0", "fd00::1"), ipv6("vmk0", "fd00::2"), ipv4("vmk1", "10.0.0.1")});
    detector.enableIndication();
    addresses.show({ipv6("vmk0", "fd00::3"), ipv4("vmk1", "10.0.0.2")});
    broker.refuseNext(2);
    cycle();
    EXPECT_EQ(summaries(broker.takeDelivered()),
              (std::vector<std::string>{"Talvex:vmk0 fd00::1/64 -> fd00::3/64", "Talvex:vmk0 fd00::2/64 -> fd00::3/64",
                                        "Talvex:vmk1 10.0.0.1/255.255.255.0 -> 10.0.0.2/255.255.255.0"}));
    const LoggedLine refused{LOG_ERR, "Failed to deliver indication " + std::to_string(CMPI_RC_ERR_FAILED) + "\n"};
    EXPECT_EQ(takeLoggedLines(), (std::vector<LoggedLine>{refused, refused}));
}

// The lines of a new instance of `className` after `set`: it starts with
// its class's defaults, as in sfcb; a property set replaces its default in
// place, the others follow in the order they were set.
std::vector<std::string> afterDefaults(const char *className, const std::vector<std::string> &set) {
    std::vector<std::string> lines = propertyLines(brokerSide(CmpiInstance(CmpiObjectPath(kNs, className))));
    for (const std::string &line : set) {
        const std::string name = line.substr(0, line.find(' ') + 1);
        const auto held = std::find_if(lines.begin(), lines.end(),
                                       [&](const std::string &old) { return old.rfind(name, 0) == 0; });
        if (held != lines.end()) {
            *held = line;
        } else {
            lines.push_back(line);
        }
    }
    return lines;
}

TEST_F(Detection, IndicationCarriesBothEndpointsAndTheSourcesPathAsText) {
    const std::string host = OMC::getComputerSystemName(thread.context, broker.broker());
    const struct {
        Entry before, after;
        const char *className;
        const char *sourceHost;
        std::vector<std::string> source, previous;  // the family's own properties
    } cases[] = {
        {ipv4("vmk1", "192.168.7.1"), ipv4("vmk1", "192.168.7.20"), "Talvex_KernelIPv4ProtocolEndpoint", "192.168.7.20",
         {"ProtocolIFType uint16 4096", "IPv4Address string 192.168.7.20", "SubnetMask string 255.255.255.0"},
         {"ProtocolIFType uint16 4096", "IPv4Address string 192.168.7.1", "SubnetMask string 255.255.255.0"}},
        {ipv6("vmk1", "fd00::1", "ffff:ffff:ffff::"), ipv6("vmk1", "fd00:0::a:2"), "Talvex_KernelIPv6ProtocolEndpoint",
         "fd00::a:2",
         {"ProtocolIFType uint16 4097", "IPv6Address string fd00::a:2", "PrefixLength uint8 64"},
         {"ProtocolIFType uint16 4097", "IPv6Address string fd00::1", "PrefixLength uint8 48"}},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(c.className);
        ScriptedInterfaceAddresses source;
        TVX::KernelIpIndication fresh(source);
        source.show({c.before});
        fresh.enableIndication();
        source.show({c.after});
        const std::time_t earliest = std::time(nullptr);
        fresh.testAndSend(thread.context, broker.broker());
        const std::time_t latest = std::time(nullptr);
        const std::vector<brokertest::Delivery> delivered = broker.takeDelivered();
        ASSERT_EQ(delivered.size(), 1u);
        EXPECT_EQ(delivered[0].nameSpace, kNs);
        const tvxbroker::Instance &event = delivered[0].event;
        EXPECT_EQ(event.path.nameSpace, kNs);
        EXPECT_EQ(event.path.className, "Talvex_KernelIPChangedIndication");

        const std::vector<std::string> lines = propertyLines(event);
        ASSERT_EQ(lines.size(), 7u);
        EXPECT_EQ(lines[0], "IndicationIdentifier string Talvex:vmk1");
        EXPECT_EQ(lines[1].rfind("IndicationTime datetime ", 0), 0u) << lines[1];
        EXPECT_EQ(lines[2], "PerceivedSeverity uint16 3");
        EXPECT_EQ(lines[3].rfind("SourceInstance instance ", 0), 0u) << lines[3];
        EXPECT_EQ(lines[4].rfind("PreviousInstance instance ", 0), 0u) << lines[4];
        EXPECT_EQ(lines[5], std::string("SourceInstanceModelPath string root/cimv2:") + c.className +
                                ".SystemCreationClassName=\"OMC_UnitaryComputerSystem\",SystemName=\"" + host +
                                "\",CreationClassName=\"" + c.className + "\",Name=\"vmk1\"");
        EXPECT_EQ(lines[6], std::string("SourceInstanceHost string ") + c.sourceHost);

        const tvxbroker::DateTime time = event.property("IndicationTime")->dateTime;
        EXPECT_FALSE(time.interval);
        EXPECT_EQ(time.microseconds % 1000000u, 0u) << "whole seconds";
        EXPECT_GE(time.microseconds / 1000000u, static_cast<std::uint64_t>(earliest));
        EXPECT_LE(time.microseconds / 1000000u, static_cast<std::uint64_t>(latest));

        const std::vector<std::string> keys = {
            "SystemCreationClassName string OMC_UnitaryComputerSystem", "SystemName string " + host,
            std::string("CreationClassName string ") + c.className,     "Name string vmk1",
            "ElementName string vmk1",                                 "NameFormat string Ostrakon Interface Name"};
        const struct {
            const char *property;
            const std::vector<std::string> &family;
        } endpoints[] = {{"SourceInstance", c.source}, {"PreviousInstance", c.previous}};
        for (const auto &endpoint : endpoints) {
            const std::shared_ptr<const tvxbroker::Instance> carried = event.property(endpoint.property)->instance;
            ASSERT_NE(carried, nullptr) << endpoint.property;
            EXPECT_EQ(carried->path.nameSpace + ":" + carried->path.className, std::string(kNs) + ":" + c.className);
            std::vector<std::string> set = keys;
            set.insert(set.end(), endpoint.family.begin(), endpoint.family.end());
            EXPECT_EQ(propertyLines(*carried), afterDefaults(c.className, set)) << endpoint.property;
        }
    }
    EXPECT_EQ(takeLoggedLines(), std::vector<LoggedLine>{});
}

}  // namespace
}  // namespace kipdtest

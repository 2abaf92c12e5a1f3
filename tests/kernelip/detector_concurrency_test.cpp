// The broker's enable and disable calls arrive on request threads while
// the monitor thread runs its cycles: the detector's lock must keep every
// flag and map access apart (run under ThreadSanitizer to see a race).
#include <gtest/gtest.h>

#include <atomic>
#include <thread>

#include "DetectionBroker.h"
#include "ScriptedInterfaceAddresses.h"
#include "SyslogCapture.h"
#include "kernelip/KernelIpIndication.h"

namespace kipdtest {
namespace {

TEST(DetectorConcurrency, EnableAndDisableDuringCyclesStayConsistent) {
    DetectionBroker broker;
    ScriptedInterfaceAddresses addresses;
    // Every read differs from the one before, so enabled cycles deliver.
    addresses.show({{ipv4("vmk0", "10.0.0.1"), ipv6("vmk0", "fd00::1")},
                    {ipv4("vmk0", "10.0.0.2"), ipv6("vmk0", "fd00::2")},
                    {ipv4("vmk0", "10.0.0.3"), ipv6("vmk0", "fd00::1")}});
    TVX::KernelIpIndication detector(addresses);
    syslogcapture::takeLoggedLines();

    std::atomic<bool> switching{true};
    std::thread monitor([&] {
        const AttachedThread thread(broker);
        while (switching) detector.testAndSend(thread.context, broker.broker());
    });
    for (int i = 0; i < 200; ++i) {
        detector.enableIndication();
        detector.disableIndication();
    }
    switching = false;
    monitor.join();

    EXPECT_EQ(addresses.unreleased(), 0);
    for (const std::string &summary : summaries(broker.takeDelivered())) {
        EXPECT_EQ(summary.rfind("Talvex:vmk0 ", 0), 0u) << summary;
        EXPECT_EQ(summary.find("<"), std::string::npos) << summary;
    }
    EXPECT_EQ(syslogcapture::takeLoggedLines(), std::vector<syslogcapture::LoggedLine>{});
}

}  // namespace
}  // namespace kipdtest

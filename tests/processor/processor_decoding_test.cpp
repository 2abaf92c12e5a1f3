// The CPUID snapshot and the host-wide records decoded from bytes, without a
// host, where the provider tests do not show them: each vendor's features
// read only from its own registers, the vendor words' order, model text
// cleaning and the power-policy names.
#include <algorithm>
#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "processor/CpuidRecord.h"
#include "processor/HostProcessorSettings.h"

namespace Processor {
namespace {

void putWord(unsigned char *at, uint32_t value) {
    for (int i = 0; i < 4; ++i) at[i] = static_cast<unsigned char>(value >> (8 * i));
}

TEST(CpuidRecord, GivesTheVendorAndEachFeatureFromItsOwnRegister) {
    const struct {
        const char *what;
        const char *vendor;  // 12 characters as the processor lays them out: EBX, EDX, ECX
        uint8_t stepping;
        uint32_t leaf1Ebx, leaf1Ecx, extendedEcx, extendedEdx;
        uint32_t vendorCode;
        uint8_t brandId, virtualization, noExecute, longMode;
        const char *steppingText;
    } cases[] = {
        {"Intel VMX among other bits", "GenuineIntel", 4, 0x00010800, 0x000000E0, 0, 0, 2, 0, 1, 0, 0, "4"},
        {"AMD ignores leaf 1 VMX", "AuthenticAMD", 2, 0, 0xFFFFFFFF, 0xFFFFFFFB, 0, 3, 0, 0, 0, 0, "2"},
        {"Intel ignores the extended SVM bit", "GenuineIntel", 9, 0, 0, 0x00000004, 0, 2, 0, 0, 0, 0, "9"},
        {"other vendor decodes nothing", "CentaurHauls", 3, 0x000000FF, ~0u, ~0u, ~0u, 1, 0, 0, 0, 0, "3"},
        {"vendor words in the wrong registers", "GenuntelineI", 0, 0, ~0u, 0, 0, 1, 0, 0, 0, 0, "0"},
    };
    for (const auto &c : cases) {
        // Laid out as the kernel does: EBX at 48, ECX at 52, EDX at 56; bytes
        // no field owns are never read.
        unsigned char record[cpuidRecordSize];
        std::memset(record, 0xA5, sizeof record);
        record[3] = c.stepping;
        std::memcpy(record + 48, c.vendor, 4);
        std::memcpy(record + 56, c.vendor + 4, 4);
        std::memcpy(record + 52, c.vendor + 8, 4);
        putWord(record + 64, c.leaf1Ebx);
        putWord(record + 68, c.leaf1Ecx);
        putWord(record + 100, c.extendedEcx);
        putWord(record + 104, c.extendedEdx);
        ProcessorDetails details;
        std::memset(&details, 0, sizeof details);
        decodeCpuidRecord(record, details);
        EXPECT_EQ(details.vendor, c.vendorCode) << c.what;
        EXPECT_EQ(details.brandId, c.brandId) << c.what;
        EXPECT_EQ(details.virtualization, c.virtualization) << c.what;
        EXPECT_EQ(details.noExecute, c.noExecute) << c.what;
        EXPECT_EQ(details.longMode, c.longMode) << c.what;
        EXPECT_STREQ(details.stepping, c.steppingText) << c.what;
    }
}

// The three settings are independent, so each row checks one of each.
TEST(HostSettings, PolicyNamesThreadWordAndModelText) {
    const struct {
        const char *policy;
        uint32_t threads;
        std::string model;
        uint8_t management, dynamic, hyperThreading;
        const char *shown;
    } cases[] = {
        {"OFF", 0, "Xeon\tGold\x7F", 0, 0, 0, "Xeon Gold "},
        {"off-peak", 0x01000000, "EPYC \xC3\xA9 7002\n", 0, 0, 1, "EPYC    7002 "},
        {"of", 0, std::string(60, 'x'), 1, 0, 0, "xxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxx"},  // 47 kept
        {"Dynamic", 0, std::string("Core\0\t\t", 7), 1, 1, 0, "Core"},
    };
    for (const auto &c : cases) {
        HostProcessorSettings host;
        std::memset(&host, 0, sizeof host);
        std::memcpy(host.powerPolicy + 8, c.policy, std::strlen(c.policy));
        putWord(host.hardwareThreads, c.threads);
        std::memcpy(host.modelText, c.model.data(), std::min(c.model.size(), sizeof host.modelText));
        ProcessorDetails details;
        std::memset(&details, 0, sizeof details);
        applyHostSettings(host, details);
        EXPECT_EQ(details.powerManagement, c.management) << '"' << c.policy << '"';
        EXPECT_EQ(details.dynamicPower, c.dynamic) << '"' << c.policy << '"';
        EXPECT_EQ(details.hyperThreading, c.hyperThreading) << c.threads;
        EXPECT_STREQ(details.modelName, c.shown);
    }
}

}  // namespace
}  // namespace Processor

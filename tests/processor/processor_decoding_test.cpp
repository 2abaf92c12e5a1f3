// The CPUID snapshot and the host-wide records decoded from bytes, without a
// host: vendor tables, feature bits in each vendor's place, the brand index,
// stepping text, model text cleaning and the power-policy names.
#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "processor/CpuidRecord.h"
#include "processor/HostProcessorSettings.h"

namespace Processor {
namespace {

struct Cpuid {
    const char *vendor;  // 12 characters as the processor lays them out: EBX, EDX, ECX
    uint8_t stepping;
    uint32_t leaf1Ebx;
    uint32_t leaf1Ecx;
    uint32_t extendedEcx;
    uint32_t extendedEdx;
};

void putWord(unsigned char *at, uint32_t value) {
    for (int i = 0; i < 4; ++i) at[i] = static_cast<unsigned char>(value >> (8 * i));
}

// Lays out a record the way the kernel does: EBX at 48, ECX at 52, EDX at 56.
void encode(const Cpuid &cpuid, unsigned char (&record)[cpuidRecordSize]) {
    std::memset(record, 0xA5, sizeof record);  // bytes no field owns are never read
    record[3] = cpuid.stepping;
    std::memcpy(record + 48, cpuid.vendor, 4);
    std::memcpy(record + 56, cpuid.vendor + 4, 4);
    std::memcpy(record + 52, cpuid.vendor + 8, 4);
    putWord(record + 64, cpuid.leaf1Ebx);
    putWord(record + 68, cpuid.leaf1Ecx);
    putWord(record + 100, cpuid.extendedEcx);
    putWord(record + 104, cpuid.extendedEdx);
}

ProcessorDetails decoded(const Cpuid &cpuid) {
    unsigned char record[cpuidRecordSize];
    encode(cpuid, record);
    ProcessorDetails details;
    std::memset(&details, 0, sizeof details);
    decodeCpuidRecord(record, details);
    return details;
}

struct CpuidCase {
    const char *name;
    Cpuid cpuid;
    uint32_t vendor;
    uint8_t brandId, virtualization, noExecute, longMode;
    const char *stepping;
};

class CpuidDecoding : public testing::TestWithParam<CpuidCase> {};

TEST_P(CpuidDecoding, GivesTheVendorAndEachFeatureFromItsOwnRegister) {
    const CpuidCase &c = GetParam();
    const ProcessorDetails details = decoded(c.cpuid);
    EXPECT_EQ(details.vendor, c.vendor);
    EXPECT_EQ(details.brandId, c.brandId);
    EXPECT_EQ(details.virtualization, c.virtualization);
    EXPECT_EQ(details.noExecute, c.noExecute);
    EXPECT_EQ(details.longMode, c.longMode);
    EXPECT_STREQ(details.stepping, c.stepping);
}

const uint32_t nx = 1u << 20, lm = 1u << 29;

INSTANTIATE_TEST_SUITE_P(
    Vendors, CpuidDecoding,
    testing::Values(
        CpuidCase{"IntelVmxAmongOtherBits", {"GenuineIntel", 4, 0x00010800, 0x000000E0, 0, 0}, 2, 0, 1, 0, 0, "4"},
        CpuidCase{"IntelEveryBitButVmx", {"GenuineIntel", 0, 0, 0xFFFFFFDF, 0xFFFFFFFF, 0}, 2, 0, 0, 0, 0, "0"},
        CpuidCase{"IntelLongModeAlone", {"GenuineIntel", 1, 0, 0, 0, lm}, 2, 0, 0, 0, 1, "1"},
        CpuidCase{"IntelNoExecuteAlone", {"GenuineIntel", 1, 0, 0, 0, nx}, 2, 0, 0, 1, 0, "1"},
        CpuidCase{"IntelBrandIndexIsTheLowByte", {"GenuineIntel", 255, 0x0001080F, 0, 0, ~0u}, 2, 15, 0, 1, 1, "255"},
        CpuidCase{"AmdSvmInTheExtendedLeaf", {"AuthenticAMD", 2, 0x000000FF, 0, 0x00000004, nx | lm}, 3, 255, 1, 1, 1, "2"},
        CpuidCase{"AmdIgnoresLeafOneVmx", {"AuthenticAMD", 2, 0, 0xFFFFFFFF, 0xFFFFFFFB, 0}, 3, 0, 0, 0, 0, "2"},
        CpuidCase{"IntelIgnoresTheExtendedSvmBit", {"GenuineIntel", 9, 0, 0, 0x00000004, 0}, 2, 0, 0, 0, 0, "9"},
        CpuidCase{"OtherVendorDecodesNothing", {"CentaurHauls", 3, 0x000000FF, ~0u, ~0u, ~0u}, 1, 0, 0, 0, 0, "3"},
        CpuidCase{"VendorWordsInTheWrongRegisters", {"GenuntelineI", 0, 0, ~0u, 0, 0}, 1, 0, 0, 0, 0, "0"},
        CpuidCase{"LowerCaseVendorIsAnother", {"genuineintel", 0, 0, ~0u, 0, 0}, 1, 0, 0, 0, 0, "0"}),
    [](const testing::TestParamInfo<CpuidCase> &param) { return std::string(param.param.name); });

HostProcessorSettings host(const std::string &policy, uint32_t threads, const std::string &model) {
    HostProcessorSettings settings;
    std::memset(&settings, 0, sizeof settings);
    std::memcpy(settings.powerPolicy + 8, policy.data(), policy.size());
    putWord(settings.hardwareThreads, threads);
    std::memcpy(settings.modelText, model.data(), std::min(model.size(), sizeof settings.modelText));
    return settings;
}

ProcessorDetails applied(const HostProcessorSettings &settings) {
    ProcessorDetails details;
    std::memset(&details, 0, sizeof details);
    applyHostSettings(settings, details);
    return details;
}

TEST(HostSettings, PowerPolicyNamesInAnyLetterCase) {
    const struct {
        const char *policy;
        uint8_t management, dynamic;
    } cases[] = {{"off", 0, 0},         {"OFF", 0, 0},         {"off-peak", 0, 0},
                 {"Off ", 0, 0},        {"of", 1, 0},          {"Dynamic", 1, 1},
                 {"DYNAMIC-low", 1, 1}, {"dynami", 1, 0},      {"static", 1, 0},
                 {"", 1, 0},            {" dynamic", 1, 0},    {"custom", 1, 0}};
    for (const auto &c : cases) {
        const ProcessorDetails details = applied(host(c.policy, 0, ""));
        EXPECT_EQ(details.powerManagement, c.management) << '"' << c.policy << '"';
        EXPECT_EQ(details.dynamicPower, c.dynamic) << '"' << c.policy << '"';
    }
}

TEST(HostSettings, AnyHardwareThreadWordCountsAsPresent) {
    EXPECT_EQ(applied(host("", 0, "")).hyperThreading, 0);
    EXPECT_EQ(applied(host("", 1, "")).hyperThreading, 1);
    EXPECT_EQ(applied(host("", 0x01000000, "")).hyperThreading, 1);
}

TEST(HostSettings, ModelTextShowsUnprintableBytesAsSpaces) {
    const struct {
        std::string model;
        const char *shown;
    } cases[] = {
        {"Xeon\tGold", "Xeon Gold"},
        {"Opteron\x7F" "6174", "Opteron 6174"},
        {"EPYC \xC3\xA9 7002\n", "EPYC    7002 "},
        {"~ plain ASCII stays !", "~ plain ASCII stays !"},
        {std::string(60, 'x'), "xxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxx"},  // 47 kept
        {std::string("Core\0\t\t", 7), "Core"},
    };
    for (const auto &c : cases) {
        EXPECT_STREQ(applied(host("", 0, c.model)).modelName, c.shown);
    }
}

}  // namespace
}  // namespace Processor

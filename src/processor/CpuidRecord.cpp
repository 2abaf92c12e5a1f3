#include "processor/CpuidRecord.h"

#include <cstdio>

#include "frame/LittleEndian.h"

namespace Processor {
namespace {

constexpr std::size_t steppingAt = 3;
constexpr std::size_t leaf0EbxAt = 48;
constexpr std::size_t leaf0EcxAt = 52;
constexpr std::size_t leaf0EdxAt = 56;
constexpr std::size_t leaf1EbxAt = 64;
constexpr std::size_t leaf1EcxAt = 68;
constexpr std::size_t extendedEcxAt = 100;
constexpr std::size_t extendedEdxAt = 104;

struct VendorWords {
    uint32_t ebx;
    uint32_t edx;
    uint32_t ecx;
};

constexpr VendorWords genuineIntel = {0x756E6547, 0x49656E69, 0x6C65746E};
constexpr VendorWords authenticAmd = {0x68747541, 0x69746E65, 0x444D4163};

uint32_t word(const unsigned char (&record)[cpuidRecordSize], std::size_t offset) {
    return frame::littleEndian(record + offset, 4);
}

bool sameWords(const VendorWords &a, const VendorWords &b) {
    return a.ebx == b.ebx && a.edx == b.edx && a.ecx == b.ecx;
}

}  // namespace

uint32_t identifyVendor(const unsigned char (&record)[cpuidRecordSize]) {
    const VendorWords words = {word(record, leaf0EbxAt), word(record, leaf0EdxAt),
                               word(record, leaf0EcxAt)};
    if (sameWords(words, genuineIntel)) return vendorIntel;
    if (sameWords(words, authenticAmd)) return vendorAmd;
    return vendorOther;
}

CpuidFields cpuidFields(uint32_t vendor, const unsigned char (&record)[cpuidRecordSize]) {
    if (vendor != vendorIntel && vendor != vendorAmd) return {};
    const uint32_t extendedEdx = word(record, extendedEdxAt);
    CpuidFields fields = {
        {"BrandID", {word(record, leaf1EbxAt), 0, 7}},
        {"XDSupported", {extendedEdx, 20, 20}},
        {"LMSupported", {extendedEdx, 29, 29}},
    };
    // Intel reports VMX in leaf 1; AMD reports SVM among its extended features.
    fields["VTSupported"] = vendor == vendorIntel ? CpuidField{word(record, leaf1EcxAt), 5, 5}
                                                  : CpuidField{word(record, extendedEcxAt), 2, 2};
    return fields;
}

uint8_t extractField(const CpuidFields &fields, const char *name) {
    const auto found = fields.find(name);
    if (found == fields.end()) return 0;
    const CpuidField &field = found->second;
    if (field.lowBit > 31 || field.highBit < field.lowBit || field.highBit > 31) return 0;
    const uint32_t width = field.highBit - field.lowBit + 1;
    const uint32_t mask = width == 32 ? ~uint32_t(0) : (uint32_t(1) << width) - 1;
    return static_cast<uint8_t>((field.registerValue >> field.lowBit) & mask);
}

void decodeCpuidRecord(const unsigned char (&record)[cpuidRecordSize], ProcessorDetails &details) {
    std::snprintf(details.stepping, sizeof details.stepping, "%u", unsigned(record[steppingAt]));
    details.vendor = identifyVendor(record);
    const CpuidFields fields = cpuidFields(details.vendor, record);
    details.brandId = extractField(fields, "BrandID");
    details.noExecute = extractField(fields, "XDSupported");
    details.virtualization = extractField(fields, "VTSupported");
    details.longMode = extractField(fields, "LMSupported");
}

}  // namespace Processor

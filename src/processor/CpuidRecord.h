// Decoding of a core's CPUID snapshot (node 607) into the package record:
// vendor, stepping and the feature fields each vendor keeps in its own place.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <string>

#include "processor/ProcessorDetails.h"

namespace Processor {

constexpr std::size_t cpuidRecordSize = 200;

constexpr uint32_t vendorOther = 1;
constexpr uint32_t vendorIntel = 2;
constexpr uint32_t vendorAmd = 3;

// The bits lowBit to highBit (inclusive) of one CPUID register.
struct CpuidField {
    uint32_t registerValue;
    uint32_t lowBit;
    uint32_t highBit;
};

using CpuidFields = std::map<std::string, CpuidField>;

uint32_t identifyVendor(const unsigned char (&record)[cpuidRecordSize]);

// The vendor's decoding table filled from the record; empty for a vendor
// whose layout is unknown.
CpuidFields cpuidFields(uint32_t vendor, const unsigned char (&record)[cpuidRecordSize]);

// The field's bits, shifted down; 0 when the table has no such field.
uint8_t extractField(const CpuidFields &fields, const char *name);

// Fills vendor, stepping, brandId, noExecute, virtualization and longMode.
void decodeCpuidRecord(const unsigned char (&record)[cpuidRecordSize], ProcessorDetails &details);

}  // namespace Processor

// The properties of a Talvex_HypervisorSoftwareIdentity instance, built
// from one version record.
#pragma once

#include <cstdint>
#include <optional>

#include "CmpiInstance.h"
#include "software/SystemVersionInfo.h"

namespace Software {

// Sets every property on `instance`: ReleaseDate only when the date text
// parses, LastStartTime (the boot time) only for the running image, the
// three version numbers only when the version text holds three.
void fillSoftwareIdentity(CmpiInstance &instance, const SystemVersionInfo &record,
                          std::uint64_t bootTimeMicros);

// The month (0 = January) of a month word, by its first three characters,
// as the platform's dates write them ("Jul"); 0 for what it does not know.
int monthOfWord(const char *word);

// Midnight local time of a "<month> <day> <year>" text, in microseconds
// since the epoch; nothing when the text does not parse or the date falls
// outside what a CIM datetime point in time can show (1970 to 9999).
std::optional<std::uint64_t> releaseDateMicros(const char *text);

// The release date of a record: releaseDateMicros of its date text, which
// need not be terminated within its field; nothing for an empty one.
std::optional<std::uint64_t> recordReleaseDate(const SystemVersionInfo &record);

// The host's boot time in microseconds since the epoch: now minus uptime.
std::uint64_t bootTimeMicros();

}  // namespace Software

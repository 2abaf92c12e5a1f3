#include "software/SoftwareIdentity.h"

#include <sys/sysinfo.h>

#include <cstdio>
#include <ctime>
#include <string>

#include "CmpiDateTime.h"
#include "frame/BoundedText.h"
#include "software/InstanceId.h"

namespace Software {
namespace {

constexpr std::int64_t microsPerSecond = 1000000;
constexpr std::int64_t firstSecondAfterYear9999 = 253402300800;  // 10000-01-01T00:00:00Z

bool isLetter(const char *word, std::size_t at, char upper) {
    for (std::size_t i = 0; i < at; ++i) {
        if (word[i] == '\0') return false;
    }
    return word[at] == upper || word[at] == upper - 'A' + 'a';
}

void setVersionNumbers(CmpiInstance &instance, const char *versionText) {
    short major = 0, minor = 0, revision = 0;
    if (std::sscanf(versionText, "%hd.%hd.%hd", &major, &minor, &revision) != 3) return;
    instance.setProperty("MinorVersion", CmpiData(static_cast<CMPIUint16>(minor)));
    instance.setProperty("MajorVersion", CmpiData(static_cast<CMPIUint16>(major)));
    instance.setProperty("RevisionNumber", CmpiData(static_cast<CMPIUint16>(revision)));
}

}  // namespace

int monthOfWord(const char *word) {
    switch (word[0]) {
    case 'A':
        return isLetter(word, 1, 'P') ? 3 : isLetter(word, 1, 'U') ? 7 : 0;
    case 'D': return 11;
    case 'F': return 1;
    case 'J':
        if (isLetter(word, 1, 'A')) return 0;
        return isLetter(word, 2, 'N') ? 5 : isLetter(word, 2, 'L') ? 6 : 0;
    case 'M':
        return isLetter(word, 2, 'R') ? 2 : isLetter(word, 2, 'Y') ? 4 : 0;
    case 'N': return 10;
    case 'O': return 9;
    case 'S': return 8;
    default: return 0;
    }
}

std::optional<std::uint64_t> releaseDateMicros(const char *text) {
    char word[64] = {};
    int day = 0;
    int year = 0;
    if (std::sscanf(text, "%63s %d %d", word, &day, &year) != 3) return std::nullopt;
    std::tm calendar{};
    calendar.tm_mday = day;
    calendar.tm_mon = monthOfWord(word);
    calendar.tm_year = year >= 1901 ? year - 1900 : year;
    calendar.tm_isdst = 0;
    const std::time_t first = std::mktime(&calendar);
    if (first == static_cast<std::time_t>(-1)) return std::nullopt;
    std::tm local{};
    if (::localtime_r(&first, &local) == nullptr) return std::nullopt;
    const std::time_t seconds = std::mktime(&local);
    if (seconds < 0 || static_cast<std::int64_t>(seconds) >= firstSecondAfterYear9999) return std::nullopt;
    return static_cast<std::uint64_t>(static_cast<std::int64_t>(seconds) * microsPerSecond);
}

std::optional<std::uint64_t> recordReleaseDate(const SystemVersionInfo &record) {
    char releaseDate[sizeof record.releaseDateText + 1];
    frame::copyBounded(releaseDate, record.releaseDateText, sizeof record.releaseDateText);
    if (releaseDate[0] == '\0') return std::nullopt;
    return releaseDateMicros(releaseDate);
}

std::uint64_t bootTimeMicros() {
    struct sysinfo system {};
    ::sysinfo(&system);
    const std::int64_t bootSeconds = static_cast<std::int64_t>(std::time(nullptr)) - system.uptime;
    return static_cast<std::uint64_t>(bootSeconds * microsPerSecond);
}

void fillSoftwareIdentity(CmpiInstance &instance, const SystemVersionInfo &record, std::uint64_t bootTimeMicros) {
    if (const std::optional<std::uint64_t> micros = recordReleaseDate(record)) {
        instance.setProperty("ReleaseDate", CmpiData(CmpiDateTime(*micros, false)));
    }
    const bool running = isRunningImage(record);
    const std::string id = makeInstanceId(record);
    const std::string name = fieldText(record.productName) + (running ? "" : " Alternate Boot Bank");
    const auto build = static_cast<std::uint32_t>(record.buildNumber);
    instance.setProperty("InstanceID", CmpiData(id));
    instance.setProperty("Name", CmpiData(name));
    instance.setProperty("Caption", CmpiData(name));
    instance.setProperty("Description", CmpiData(name));
    instance.setProperty("ElementName", CmpiData(id));
    instance.setProperty("LargeBuildNumber", CmpiData(static_cast<CMPIUint64>(build)));
    if (running) instance.setProperty("LastStartTime", CmpiData(CmpiDateTime(bootTimeMicros, false)));
    const std::string version = fieldText(record.versionText);
    instance.setProperty("VersionString", CmpiData(version + " build-" + std::to_string(build)));
    setVersionNumbers(instance, version.c_str());
    instance.setProperty("Manufacturer", CmpiData("Talvex, Inc."));
    instance.setProperty("IsEntity", CmpiData(true));
}

}  // namespace Software

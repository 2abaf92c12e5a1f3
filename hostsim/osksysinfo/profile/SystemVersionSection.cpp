// "systemVersion": the running image's version record. The record keeps
// every text terminated within its field, so a text that would not fit is
// refused rather than cut.
#include <limits>
#include <string>

#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

void readRecordText(JsonObjectReader &fields, const char *key, std::size_t fieldWidth, std::string &into) {
    const std::optional<std::string> value = fields.text(key);
    if (!value) return;
    if (value->size() >= fieldWidth || value->find('\0') != std::string::npos) {
        fields.fail(key, "expected a text of at most " + std::to_string(fieldWidth - 1) +
                             " bytes without NUL, got \"" + *value + "\"");
    }
    into = *value;
}

}  // namespace

void readSystemVersion(JsonObjectReader &host, HostProfile &profile) {
    SystemVersionProfile &version = profile.systemVersion;
    version.productName = profile.serviceConsole ? "Talvex Corla" : "Talvex Corlai";
    host.object("systemVersion", [&version](JsonObjectReader &fields) {
        readRecordText(fields, "productName", 32, version.productName);
        readRecordText(fields, "versionText", 32, version.versionText);
        readRecordText(fields, "infoText", 32, version.infoText);
        readRecordText(fields, "releaseDate", 64, version.releaseDate);
        if (const auto build = fields.signedInteger("buildNumber", std::numeric_limits<std::int32_t>::min(),
                                                    std::numeric_limits<std::int32_t>::max())) {
            version.buildNumber = static_cast<std::int32_t>(*build);
        }
        fields.finish();
    });
}

}  // namespace hostsim

#include "profile/ProfileReader.h"

#include "profile/JsonObjectReader.h"
#include "profile/JsonText.h"
#include "profile/ProfileError.h"
#include "profile/ProfileSections.h"

namespace hostsim {

namespace {

bool readServiceConsole(JsonObjectReader &host) {
    const std::optional<std::string> type = host.text("hostType");
    if (!type) host.fail("hostType", "missing");
    if (*type == "Corla") return true;
    if (*type != "Corlai") host.fail("hostType", "expected \"Corla\" or \"Corlai\", got \"" + *type + "\"");
    return false;
}

}  // namespace

HostProfile parseProfile(const std::string &json) {
    const nlohmann::json document = parseJson(json);
    JsonObjectReader host(document, "");
    HostProfile profile;
    profile.hostName = host.text("hostName").value_or(profile.hostName);
    profile.serviceConsole = readServiceConsole(host);
    readAdapters(host, profile);
    readProcessors(host, profile);
    readInterfaces(host, profile);
    readSystemVersion(host, profile);
    readFaults(host, profile);
    readWatchedElements(host, profile);
    host.finish();
    return profile;
}

}  // namespace hostsim

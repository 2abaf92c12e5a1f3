// sfcb's provider registration file: a "[ClassName]" line starts the block
// of one class, followed by "key: value" lines naming the provider.
#pragma once

#include <string>
#include <vector>

namespace tvxbroker {

struct ProviderRegistration {
    std::string className;
    std::string providerName;
    std::string location;  // the library is lib<location>.so
    bool instance = false;
    bool association = false;
    bool indication = false;
    bool method = false;
    std::vector<std::string> namespaces;
    // Providers naming the same group run in one process under sfcb; empty
    // when the block names none.
    std::string group;
    // "unload: never": sfcb keeps the provider loaded however long it idles.
    bool unloadNever = false;
};

// Throws std::runtime_error "origin:line: message" for a malformed line, an
// unknown key or type, a group that is not one name, an unload other than
// "never", a block lacking provider, location, type or namespace, and a
// class registered twice.
std::vector<ProviderRegistration> parseRegistration(const std::string &text, const std::string &origin);

// As parseRegistration with the path as origin; throws "cannot read <path>".
std::vector<ProviderRegistration> readRegistrationFile(const std::string &path);

}  // namespace tvxbroker

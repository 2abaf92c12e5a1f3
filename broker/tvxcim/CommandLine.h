// The command line of tvxcim: options first, then a command and its
// argument.
#pragma once

#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include "core/Broker.h"

namespace tvxcim {

// The namespace of a class named without one, and of the demo's requests.
inline constexpr const char *defaultNameSpace = "root/cimv2";

struct CommandLine {
    std::vector<std::string> providerDirs;
    std::vector<std::string> registrations;
    std::vector<std::string> mofFiles;
    tvxbroker::PropertyList properties;
    std::string assocClass;
    std::string resultClass;
    std::string role;
    std::string resultRole;
    // How long demo waits for each first indication (10 s when not given),
    // and how long listen listens (until interrupted when not given).
    std::optional<double> seconds;
    bool json = false;
    // Stand in for stock sfcb 1.3 rather than the host's broker: provider
    // threads give their objects back with the memory table's mark and
    // release, and contexts have no eighth entry.
    bool stockSfcb = false;
    bool help = false;  // nothing else is read then
    std::string command;
    std::string argument;
};

class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Throws UsageError with a one-line reason.
CommandLine parseCommandLine(const std::vector<std::string> &args);
extern const char *const usageText;

}  // namespace tvxcim

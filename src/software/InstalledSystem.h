// The computer system the installed-software association names, captured
// once: its keys, each cut to 127 characters, and its path.
#pragma once

#include <string>

#include "CmpiObjectPath.h"

namespace Software {

constexpr const char *computerSystemClass = "OMC_UnitaryComputerSystem";
constexpr const char *installedSoftwareClass = "Talvex_InstalledSoftwareIdentity";
// The namespace of the system path in the association's own instances.
constexpr const char *installedSystemNamespace = "/root/cimv2";

struct InstalledSystem {
    char systemCreationClassName[128];
    char systemName[128];
};

InstalledSystem captureInstalledSystem(const std::string &name, const std::string &className);

// The system's path in `ns`: Name, then CreationClassName.
CmpiObjectPath installedSystemPath(const InstalledSystem &system, const CmpiString &ns);

}  // namespace Software

#include "software/InstalledSystem.h"

#include "frame/BoundedText.h"

namespace Software {

InstalledSystem captureInstalledSystem(const std::string &name, const std::string &className) {
    InstalledSystem system{};
    frame::copyBounded(system.systemName, name.c_str());
    frame::copyBounded(system.systemCreationClassName, className.c_str());
    return system;
}

CmpiObjectPath installedSystemPath(const InstalledSystem &system, const CmpiString &ns) {
    CmpiObjectPath path(ns, computerSystemClass);
    path.setKey("Name", CmpiData(system.systemName));
    path.setKey("CreationClassName", CmpiData(system.systemCreationClassName));
    return path;
}

}  // namespace Software

// The fixed systems, devices and links both test providers serve. Paths are
// built without a namespace, as a reference inside an association may be.
#pragma once

#include <string>

#include "CmpiObjectPath.h"
#include "CmpiStatus.h"

namespace omctest {

struct Device {
    const char *id;
    const char *className;
    const char *model;
    CMPIUint32 size;
};

constexpr Device kDevices[] = {
    {"disk0", "Test_Disk", "Kestrel", 500},
    {"nic0", "Test_Device", "Osprey", 1},
    {"disk1", "Test_Disk", "Kestrel", 250},
};

constexpr const char *kSystems[] = {"alpha", "beta", "lonely", "broken"};

// Asking for the associations of this system fails.
constexpr const char *kBrokenSystem = "broken";

struct Link {
    const char *assocClass;
    const char *system;
    const char *deviceClass;
    const char *device;
};

constexpr Link kLinks[] = {
    {"Test_HostedDevice", "alpha", "Test_Disk", "disk0"},
    {"Test_HostedDevice", "alpha", "Test_Device", "nic0"},
    {"Test_HostedDevice", "alpha", "Test_Disk", "ghost"},  // a device that does not exist
    {"Test_SpareDevice", "alpha", "Test_Disk", "disk1"},
    {"Test_HostedDevice", "beta", "Test_Disk", "disk0"},
    {"Test_HostedDevice", "broken", "Test_Disk", "disk9"},
};

inline CmpiObjectPath systemPath(const char *name) {
    CmpiObjectPath path(nullptr, "Test_System");
    path.setKey("Name", name);
    return path;
}

inline CmpiObjectPath devicePath(const char *className, const char *id) {
    CmpiObjectPath path(nullptr, className);
    path.setKey("DeviceID", id);
    return path;
}

inline std::string stringKey(const CmpiObjectPath &path, const char *key) {
    const CmpiData value = path.getKey(key);
    if (value.isNotFound() || value.isNullValue()) {
        throw CmpiStatus(CMPI_RC_ERR_INVALID_PARAMETER, "key missing");
    }
    return static_cast<const char *>(value);
}

}  // namespace omctest

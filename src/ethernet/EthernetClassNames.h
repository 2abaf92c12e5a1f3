// The classes the Ethernet port provider serves, spelt as paths carry them.
#pragma once

#include "ethernet/PnicDetails.h"

namespace EthernetProvider {

inline constexpr const char *portClass = "Talvex_EthernetPort";
inline constexpr const char *driverIdentityClass = "Talvex_EPDriverSoftwareIdentity";
inline constexpr const char *firmwareIdentityClass = "Talvex_EPFirmwareSoftwareIdentity";
inline constexpr const char *driverElementClass = "Talvex_EPDriverElementSoftwareIdentity";
inline constexpr const char *firmwareElementClass = "Talvex_EPFirmwareElementSoftwareIdentity";

// An identity is the driver or the firmware of one adapter; the two share
// everything but their names.
struct IdentityKind {
    const char *identityClass;
    const char *elementClass;
    const char *instanceIdPrefix;
    const char *elementNameSuffix;
    char (PnicDetails::*version)[32];
};

inline constexpr IdentityKind driverIdentity{driverIdentityClass, driverElementClass,
                                             "Talvex:Talvex_EPDriverSoftwareIdentity:", " driver ",
                                             &PnicDetails::driverVersion};
inline constexpr IdentityKind firmwareIdentity{
    firmwareIdentityClass, firmwareElementClass, "Talvex:Talvex_EPFirmwareSoftwareIdentity:",
    " device firmware ", &PnicDetails::firmwareVersion};

}  // namespace EthernetProvider

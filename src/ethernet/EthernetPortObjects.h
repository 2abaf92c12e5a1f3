// The paths and instances built from one adapter record: the port, its
// driver and firmware identities and the associations between them.
#pragma once

#include <string>

#include "CmpiBroker.h"
#include "CmpiContext.h"
#include "CmpiInstance.h"
#include "CmpiObjectPath.h"
#include "CmpiStatus.h"
#include "CmpiString.h"
#include "ethernet/EthernetClassNames.h"
#include "ethernet/PnicDetails.h"

namespace EthernetProvider {

// Every lookup by a missing adapter key answers this.
CmpiStatus deviceIdNotValid();

// Keys DeviceID, SystemCreationClassName, SystemName, CreationClassName.
CmpiObjectPath buildPortPath(const CmpiContext &ctx, CmpiBroker *broker, const CmpiString &ns,
                             const char *deviceId);

CmpiObjectPath buildIdentityPath(const IdentityKind &kind, const CmpiString &ns,
                                 const char *deviceId);

// The adapter name inside an InstanceID: what follows its last colon, or the
// whole text when it has none; at most 127 characters.
std::string deviceIdFromInstanceId(const char *instanceId);

CmpiInstance buildPortInstance(const CmpiContext &ctx, CmpiBroker *broker, const CmpiString &ns,
                               const PnicDetails &pnic, const char **properties);

CmpiInstance buildIdentityInstance(const IdentityKind &kind, const CmpiString &ns,
                                   const PnicDetails &pnic);

// An association instance: its own path has no keys; the two ends are
// properties. The inventory's instances also carry ElementSoftwareStatus.
CmpiInstance buildElementInstance(const IdentityKind &kind, const CmpiString &ns,
                                  const CmpiObjectPath &port, const CmpiObjectPath &identity,
                                  bool withStatus);

// The association's name: the two ends as keys.
CmpiObjectPath buildElementPath(const IdentityKind &kind, const CmpiString &ns,
                                const CmpiObjectPath &port, const CmpiObjectPath &identity);

}  // namespace EthernetProvider

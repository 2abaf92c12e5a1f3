/* Control of the stand-in platform libraries, for tests and tools: which host
 * profile is served, and how many parameter lists are alive. Exported from
 * libosksysinfo.so beside the PRB_ functions; a real host has none of it. */
#pragma once

#include <stddef.h>
#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

/* Statuses returned by the stand-in's PRB_ functions (0 is success). Callers
 * on a real host only test for non-zero; tests use them to tell why. */
enum HostSimStatus {
    HOSTSIM_STATUS_OK = 0,
    HOSTSIM_STATUS_BAD_ARGUMENT = 1, /* null pointer, negative size or index, wrong parameter shape */
    HOSTSIM_STATUS_NO_PROFILE = 2,   /* the host profile could not be read */
    HOSTSIM_STATUS_UNKNOWN_NODE = 3, /* no such node, or the node has no instance list / no value */
    HOSTSIM_STATUS_BAD_SIZE = 4,     /* buffer size differs from the node's record size */
    HOSTSIM_STATUS_NOT_FOUND = 5,    /* no such instance, or index past the end of a list */
    HOSTSIM_STATUS_WRONG_TYPE = 6,   /* list entry of the other type, or an integer beyond 32 bits */
    HOSTSIM_STATUS_INJECTED = 7      /* a fault of the profile failed this call */
};

/* Each loader returns 0, or non-zero with a one-line reason written into
 * error (truncated to errorSize, always terminated; error may be null). A
 * failed load leaves the served profile as it was. Loading a profile resets
 * the call counters of its faults. */
int HostSim_LoadProfileText(const char *json, char *error, size_t errorSize);
/* The reason starts with the path: "<path>: <reason>". */
int HostSim_LoadProfileFile(const char *path, char *error, size_t errorSize);
/* Validates a profile file without serving it. */
int HostSim_CheckProfileFile(const char *path, char *error, size_t errorSize);

/* Back to the state at process start: the next call loads the profile named
 * by TVX_HOST_PROFILE, or the built-in default when it is unset or empty. */
void HostSim_ResetProfile(void);

/* How many calls were counted against the served profile's fault rule at
 * `rule` (its index in "faults") since the profile was loaded, whether the
 * rule failed them or not: with "nth" set, whether that call was reached.
 * 0 for an index past the rules, or when no profile could be read. */
uint64_t HostSim_FaultMatchCount(size_t rule);

/* The built-in default profile as JSON text (static storage). */
const char *HostSim_DefaultProfileText(void);

/* Sets *hasConsole non-zero on a "Corla" host (one with a service console).
 * When no profile can be read, sets it to 0 and returns HOSTSIM_STATUS_NO_PROFILE. */
int HostSim_HasServiceConsole(int *hasConsole);

/* The running image's version record from the profile's "systemVersion",
 * for liboskuser's version query: 0, or the status of a fault rule for
 * OskuserVersion_GetSystemVersion (the record then untouched), or
 * HOSTSIM_STATUS_NO_PROFILE. */
struct SystemVersionInfo;
int HostSim_GetSystemVersion(struct SystemVersionInfo *info);

/* How a value the profile scripts is served: not at all, as a null uint16,
 * or as a value of one CIM type. */
enum HostSimValueType {
    HOSTSIM_VALUE_MISSING = 0, /* the property is not set */
    HOSTSIM_VALUE_NULL = 1,    /* set, as a null uint16 */
    HOSTSIM_VALUE_UINT16 = 2,
    HOSTSIM_VALUE_UINT64 = 3,
    HOSTSIM_VALUE_SINT64 = 4,
    HOSTSIM_VALUE_BOOLEAN = 5,
    HOSTSIM_VALUE_STRING = 6
};

struct HostSimValue {
    enum HostSimValueType type;
    uint64_t unsignedValue; /* UINT16 and UINT64; BOOLEAN as 0 or 1 */
    int64_t signedValue;    /* SINT64 */
    const char *text;       /* STRING; null for every other type */
};

struct HostSimWatchedKey {
    const char *name;
    struct HostSimValue value; /* STRING, UINT64, SINT64 or BOOLEAN */
};

/* One element of "watchedElements": its object path and the HealthState of
 * the poll asked for. */
struct HostSimWatchedElement {
    const char *className; /* as the profile spells it */
    const char *nameSpace;
    const char *hostName;  /* null: the path names no host */
    const struct HostSimWatchedKey *keys; /* in profile order */
    size_t keyCount;
    struct HostSimValue healthState;
};

struct HostSimWatchedElements {
    const struct HostSimWatchedElement *elements;
    size_t count;
};

/* The elements of "watchedElements" whose class is className (ASCII letters
 * compared without case), in profile order, as copies that stay valid until
 * HostSim_FreeWatchedElements whatever profile is loaded meanwhile. Each
 * class counts its enumerations from 0 since its profile was loaded: with
 * enumeration non-zero, this is the next one and carries its poll's
 * HealthState; with 0, the answer carries the last enumerated poll's (poll 0
 * before any) and counts nothing. Returns 0 and sets *answer (no elements:
 * count 0), or HOSTSIM_STATUS_BAD_ARGUMENT or HOSTSIM_STATUS_NO_PROFILE and
 * sets *answer to null. */
int HostSim_GetWatchedElements(const char *className, int enumeration, struct HostSimWatchedElements **answer);
/* Frees an answer of HostSim_GetWatchedElements; null is ignored. */
void HostSim_FreeWatchedElements(struct HostSimWatchedElements *answer);

/* Parameter lists handed out (PRB_ParamListCreate, PRB_GetInstanceListAlloc)
 * and destroyed since the process started; live = created - destroyed.
 * Destroying anything that is not a live list (twice, or a foreign pointer)
 * frees nothing and is counted as foreign. */
size_t HostSim_LiveListCount(void);
size_t HostSim_CreatedListCount(void);
size_t HostSim_DestroyedListCount(void);
size_t HostSim_ForeignDestroyCount(void);

#ifdef __cplusplus
}
#endif

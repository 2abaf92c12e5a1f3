/*
 * What the conformance objects hold: the plain-C provider builds them
 * through the CMPI function tables, the binding test through the binding.
 * Both and the expectations read this one table, so a difference the tests
 * find lies in how values crossed the boundary, never in the data.
 */
#ifndef TVX_CONFORMANCE_SAMPLES_H
#define TVX_CONFORMANCE_SAMPLES_H

#include "cmpi/cmpidt.h"

/* One Conf_CSample. Name is passed as CMPI_chars, Label and Made as
 * CMPIStrings from the broker's newString; Missing (a string) and Vacant (a
 * uint16) are always null. */
struct conf_sample {
    const char *name;
    const char *label;
    CMPIUint16 slot;
    const char *text;
    const char *made;
    CMPIBoolean enabled;
    CMPIUint64 count;
    CMPISint64 offset;
    CMPIReal64 ratio;
    CMPIUint64 taken;  /* a point in time: microseconds since the epoch, UTC */
    CMPIUint64 uptime; /* an interval in microseconds */
    const char *part_id;
    CMPIUint32 part_size;
};

#define CONF_SAMPLE_COUNT 2

/* The first holds values around 2^32 and multi-byte UTF-8; the second the
 * extremes: empty text, uint64 and sint64 limits, the last point in time
 * and the longest interval a CIM datetime can write. */
static const struct conf_sample conf_samples[CONF_SAMPLE_COUNT] = {
    {"sample-1", "Z\xc3\xbcrich \xe2\x9c\x93", 1, "Gr\xc3\xbc\xc3\x9f" "e aus \xe6\x9d\xb1\xe4\xba\xac",
     "made by newString", 1, 4294967297ULL, -5000000000LL, 0.1, 1614834367123456ULL,
     93784000005ULL, "part-1", 7},
    {"sample-2", "plain", 65535, "", "\xc3\xa9t\xc3\xa9", 0, 18446744073709551615ULL,
     -9223372036854775807LL - 1, -6.02214076e23, 253402300799999999ULL, 8639999999999999999ULL,
     "part-2", 4294967295U},
};

/* Names[]: element 0 set as CMPI_chars, element 2 as a CMPIString, element 1
 * never set. The array is made with element type CMPI_chars. */
#define CONF_NAMES_SIZE 3
#define CONF_NAMES_0 "first"
#define CONF_NAMES_2 "th\xc3\xaerd"

/* Counts[]: elements 0 and 3 set, 1 and 2 never set. */
#define CONF_COUNTS_SIZE 4
#define CONF_COUNTS_0 7U
#define CONF_COUNTS_3 4294967295U

/* The one Conf_CPeer ties the first sample (Antecedent) to the second
 * (Dependent). */

#endif

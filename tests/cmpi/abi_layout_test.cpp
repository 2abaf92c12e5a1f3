// Pins the CMPI 2.0 binary layout a broker such as sfcb relies on: where each
// table's functions start and end and how many it has, selected slots, the
// data structures and the type codes the header builds from bit fields.
// Builds for x86_64 and i386 alike.
#include <gtest/gtest.h>

#include <cstddef>
#include <type_traits>

#include "cmpi/cmpi_context_ext.h"
#include "cmpi/cmpift.h"

namespace {

constexpr std::size_t P = sizeof(void *);
constexpr bool kIlp32 = sizeof(void *) == 4;

// Leading data members, counted in pointer slots. A lone int is padded to a
// full slot on both targets; the two ints of the broker and MI tables share
// one slot on x86_64 but take two on i386, so miName sits at slot 1 or 2.
constexpr std::size_t kVersionOnly = 1;
constexpr std::size_t kTwoIntsAndName = kIlp32 ? 3 : 2;

struct Table {
    const char *name;
    std::size_t size, first, last, header, functions;
};

#define TABLE(T, first, last, header, n) \
    Table { #T, sizeof(T), offsetof(T, first), offsetof(T, last), header, n }

const Table kTables[] = {
    TABLE(CMPIBrokerFT, prepareAttachThread, getProperty, kTwoIntsAndName, 18),
    TABLE(CMPIBrokerEncFT, newInstance, getMessage2, kVersionOnly, 20),
    TABLE(CMPIBrokerExtFT, resolveFileName, signalCondition, kVersionOnly, 20),
    TABLE(CMPIBrokerMemFT, mark, freeSelectExp, kVersionOnly, 14),
    TABLE(CMPIContextFT, release, addEntry, kVersionOnly, 6),
    TABLE(CMPIResultFT, release, returnError, kVersionOnly, 7),
    TABLE(CMPIInstanceFT, release, setPropertyWithOrigin, kVersionOnly, 10),
    TABLE(CMPIObjectPathFT, release, toString, kVersionOnly, 19),
    TABLE(CMPIArgsFT, release, getArgCount, kVersionOnly, 6),
    TABLE(CMPIStringFT, release, getCharPtr, kVersionOnly, 3),
    TABLE(CMPIArrayFT, release, setElementAt, kVersionOnly, 6),
    TABLE(CMPIEnumerationFT, release, toArray, kVersionOnly, 5),
    TABLE(CMPIDateTimeFT, release, isInterval, kVersionOnly, 5),
    TABLE(CMPISelectExpFT, release, evaluateUsingAccessor, kVersionOnly, 7),
    TABLE(CMPISelectCondFT, release, getSubCondAt, kVersionOnly, 4),
    TABLE(CMPISubCondFT, release, getPredicate, kVersionOnly, 5),
    TABLE(CMPIPredicateFT, release, evaluateUsingAccessor, kVersionOnly, 4),
    TABLE(CMPIErrorFT, release, setMessageArguments, kVersionOnly, 26),
    TABLE(CMPIInstanceMIFT, cleanup, execQuery, kTwoIntsAndName, 8),
    TABLE(CMPIAssociationMIFT, cleanup, referenceNames, kTwoIntsAndName, 5),
    TABLE(CMPIMethodMIFT, cleanup, invokeMethod, kTwoIntsAndName, 2),
    TABLE(CMPIPropertyMIFT, cleanup, setPropertyWithOrigin, kTwoIntsAndName, 4),
    TABLE(CMPIIndicationMIFT, cleanup, disableIndications, kTwoIntsAndName, 7),
};

TEST(CmpiAbi, EveryTableHasItsSlotsAndNoMore) {
    for (const Table &t : kTables) {
        SCOPED_TRACE(t.name);
        EXPECT_EQ(t.first / P, t.header);
        EXPECT_EQ(t.first % P, 0u);
        EXPECT_EQ(t.last / P, t.header + t.functions - 1);
        EXPECT_EQ(t.size, (t.header + t.functions) * P);
    }
}

// Index of a function inside its table, counted from the first function.
#define SLOT(T, first, m, i) \
    EXPECT_EQ((offsetof(T, m) - offsetof(T, first)) / P, std::size_t{i}) << #T "." #m

TEST(CmpiAbi, FunctionsSitAtTheirIndex) {
    SLOT(CMPIBrokerFT, prepareAttachThread, deliverIndication, 3);
    SLOT(CMPIBrokerFT, prepareAttachThread, enumerateInstances, 10);
    SLOT(CMPIBrokerFT, prepareAttachThread, invokeMethod, 15);
    SLOT(CMPIBrokerEncFT, newInstance, getMessage, 13);
    SLOT(CMPIBrokerEncFT, newInstance, logMessage, 14);
    SLOT(CMPIBrokerEncFT, newInstance, newCMPIError, 16);
    SLOT(CMPIBrokerExtFT, resolveFileName, createThreadKey, 7);
    SLOT(CMPIBrokerExtFT, resolveFileName, newMutex, 11);
    SLOT(CMPIBrokerMemFT, mark, cmpiFree, 6);
    SLOT(CMPIInstanceFT, release, setObjectPath, 8);
    SLOT(CMPIObjectPathFT, release, getKeyCount, 11);
    SLOT(CMPIObjectPathFT, release, getClassQualifier, 14);
    SLOT(CMPIErrorFT, release, getMessageArguments, 16);
    SLOT(CMPIErrorFT, release, setErrorType, 17);
    SLOT(CMPIIndicationMIFT, cleanup, mustPoll, 2);
    SLOT(CMPIIndicationMIFT, cleanup, enableIndications, 5);
}

// 2.0 indication calls take no CMPIResult; enable/disable return a status.
static_assert(std::is_same<decltype(CMPIIndicationMIFT::activateFilter),
                           CMPIStatus (*)(CMPIIndicationMI *, const CMPIContext *,
                                          const CMPISelectExp *, const char *,
                                          const CMPIObjectPath *, CMPIBoolean)>::value, "");
static_assert(std::is_same<decltype(CMPIIndicationMIFT::enableIndications),
                           CMPIStatus (*)(CMPIIndicationMI *, const CMPIContext *)>::value, "");
static_assert(std::is_same<decltype(CMPIBrokerExtFT::createThreadKey),
                           int (*)(unsigned int *, void (*)(void *))>::value, "");

// The host broker's eighth context entry follows the published seven.
TEST(CmpiAbi, TheHostContextEntryFollowsThePublishedTable) {
    EXPECT_EQ(offsetof(CMPIContextExtFT, releaseThreadObjects), sizeof(CMPIContextFT));
    EXPECT_EQ(sizeof(CMPIContextExtFT), sizeof(CMPIContextFT) + P);
}

TEST(CmpiAbi, ObjectsAndBrokerAreHandlePlusTables) {
    EXPECT_EQ(offsetof(CMPIInstance, ft), P);
    EXPECT_EQ(sizeof(CMPIObjectPath), 2 * P);
    EXPECT_EQ(sizeof(CMPIInstanceMI), 2 * P);
    EXPECT_EQ(offsetof(CMPIBroker, bft), 1 * P);
    EXPECT_EQ(offsetof(CMPIBroker, xft), 3 * P);
    EXPECT_EQ(offsetof(CMPIBroker, mft), 4 * P);
    EXPECT_EQ(sizeof(CMPIBroker), 5 * P);
}

TEST(CmpiAbi, ScalarsValueDataAndStatus) {
    EXPECT_EQ(sizeof(CMPIBoolean) + sizeof(CMPIUint8) + sizeof(CMPISint8), 3u);
    EXPECT_EQ(sizeof(CMPIChar16) + sizeof(CMPIUint16) + sizeof(CMPISint16), 6u);
    EXPECT_EQ(sizeof(CMPIUint32) + sizeof(CMPISint32) + sizeof(CMPIReal32), 12u);
    EXPECT_EQ(sizeof(CMPIUint64) + sizeof(CMPISint64) + sizeof(CMPIReal64), 24u);
    EXPECT_EQ(sizeof(CMPICount) + sizeof(CMPIFlags) + sizeof(CMPIrc), 12u);
    EXPECT_EQ(sizeof(CMPIType) + sizeof(CMPIValueState), 4u);
    EXPECT_EQ(offsetof(CMPIData, state), 2u);
    // i386 aligns 64-bit members to 4 inside structures; the pointer-and-count
    // member is what makes the union 16 bytes on x86_64.
    EXPECT_EQ(sizeof(CMPIValue), kIlp32 ? 8u : 16u);
    EXPECT_EQ(offsetof(CMPIData, value), kIlp32 ? 4u : 8u);
    EXPECT_EQ(sizeof(CMPIData), kIlp32 ? 12u : 24u);
    EXPECT_EQ(offsetof(CMPIStatus, msg), P);
    EXPECT_EQ(sizeof(CMPIStatus), 2 * P);
}

TEST(CmpiAbi, TypeCodesAndValueStates) {
    const unsigned codes[][2] = {
        {CMPI_null, 0},          {CMPI_boolean, 2},         {CMPI_char16, 3},
        {CMPI_real32, 8},        {CMPI_real64, 12},         {CMPI_uint8, 128},
        {CMPI_uint16, 144},      {CMPI_uint32, 160},        {CMPI_uint64, 176},
        {CMPI_sint8, 192},       {CMPI_sint16, 208},        {CMPI_sint32, 224},
        {CMPI_sint64, 240},      {CMPI_instance, 0x1000},   {CMPI_ref, 0x1100},
        {CMPI_args, 0x1200},     {CMPI_class, 0x1300},      {CMPI_filter, 0x1400},
        {CMPI_enumeration, 0x1500}, {CMPI_string, 0x1600},  {CMPI_chars, 0x1700},
        {CMPI_dateTime, 0x1800}, {CMPI_ptr, 0x1900},        {CMPI_charsptr, 0x1A00},
        {CMPI_ARRAY, 0x2000},    {CMPI_stringA, 0x3600},    {CMPI_uint64A, 0x20B0},
        {CMPI_goodValue, 0},     {CMPI_nullValue, 0x100},   {CMPI_keyValue, 0x200},
        {CMPI_notFound, 0x400},  {CMPI_badValue, 0x8000},
    };
    for (const auto &c : codes) EXPECT_EQ(c[0], c[1]);
}

}  // namespace

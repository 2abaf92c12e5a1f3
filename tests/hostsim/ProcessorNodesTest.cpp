#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

nlohmann::json packagesOf(const std::vector<nlohmann::json> &packages) {
    return host({}, {}, {{"packages", nlohmann::json(packages)}});
}

Bytes word(std::uint32_t value) {
    return {Bytes::value_type(value), Bytes::value_type(value >> 8), Bytes::value_type(value >> 16),
            Bytes::value_type(value >> 24)};
}

std::vector<std::int32_t> servedNumbers(int node) {
    const List list = instanceList(node);
    std::vector<std::int32_t> numbers(std::size_t(PRB_ParamListUsedCount(list.get())));
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        EXPECT_EQ(PRB_ParamListGetInt32(list.get(), int(i), &numbers[i]), HOSTSIM_STATUS_OK);
    }
    return numbers;
}

Bytes readCore(int node, std::size_t size, std::int64_t instance) {
    Bytes record(size, 0xa5);
    EXPECT_EQ(readNode(node, {instance}, record), HOSTSIM_STATUS_OK) << node << " of " << instance;
    return record;
}

class HostSimProcessorNodes : public HostSimTest {};

TEST_F(HostSimProcessorNodes, CpuidRecordsOfThePackageOrOfTheCore) {
    // vendor text, then leaf 0 EBX, EDX and ECX as numbers
    const std::tuple<const char *, std::uint32_t, std::uint32_t, std::uint32_t> vendors[] = {
        {"GenuineIntel", 0x756E6547, 0x49656E69, 0x6C65746E},
        {"Odd", 0x0064644F, 0, 0},
    };
    for (const auto &[vendor, ebx, edx, ecx] : vendors) {
        const nlohmann::json cpuid = {{"vendor", vendor},         {"stepping", 255},
                                      {"leaf1Ebx", 0x11223344},   {"leaf1Ecx", "0x55667788"},
                                      {"extendedEcx", "0x99AABBCC"}, {"extendedEdx", 0xDDEEFF00}};
        const nlohmann::json ownCpuid = {{"cpuid", {{"stepping", 3}}}};
        serve(packagesOf({{{"cpuid", cpuid}, {"cores", {{{"instance", 7}}, ownCpuid}}}}));
        expectFieldsElseZero(readCore(607, 200, 7), {{3, {255}}, {48, word(ebx)}, {52, word(ecx)}, {56, word(edx)},
                                                     {64, word(0x11223344)}, {68, word(0x55667788)},
                                                     {100, word(0x99AABBCC)}, {104, word(0xDDEEFF00)}});
        expectFieldsElseZero(readCore(607, 200, 1), {{3, {3}}});
    }
}

TEST_F(HostSimProcessorNodes, HostWideRecordsTakeNoParameters) {
    const std::string alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789";
    // processors section, node, record size, fields
    const std::tuple<nlohmann::json, int, std::size_t, Fields> cases[] = {
        {{{"hardwareThreads", "0xdeadbeef"}}, 605, 36, {{0, word(0xdeadbeef)}}},
        {nullptr, 605, 36, {}},
        {{{"modelText", alphabet}}, 606, 48, {{0, textField(alphabet, 48)}}},
        {nullptr, 606, 48, {}},
        {{{"powerPolicy", std::string(600, 'p')}}, 1443, 588, {{8, Bytes(580, 'p')}}},
        {nullptr, 1443, 588, {}},
    };
    for (const auto &[processors, node, size, fields] : cases) {
        serve(host({}, {}, processors));
        Bytes record(size, 0xa5);
        ASSERT_EQ(PRB_Get(node, nullptr, record.data(), int(size)), HOSTSIM_STATUS_OK) << processors;
        expectFieldsElseZero(record, fields);
        record.assign(size, 0xa5);
        ASSERT_EQ(readNode(node, {}, record), HOSTSIM_STATUS_OK) << "an empty list is no parameters";
    }
}

TEST_F(HostSimProcessorNodes, ListsInProfileOrderWithDefaultNumbersAndCoreCounts) {
    serve(packagesOf({
        {{"instance", -5}, {"cores", {{{"instance", 100}}, {{"count", 2}}}}},
        {{"cores", {{{"count", 3}, {"state", 2}}}}},
        {{"instance", "0x10"}, {"coreCount", 12}},
    }));
    EXPECT_EQ(servedNumbers(608), (std::vector<std::int32_t>{-5, 1, 16}));
    EXPECT_EQ(servedNumbers(607), (std::vector<std::int32_t>{100, 1, 2, 3, 4, 5}));
    for (const auto &[package, cores] : {std::pair{-5, 3u}, std::pair{1, 3u}, std::pair{16, 12u}}) {
        EXPECT_EQ(readCore(608, 4, package), word(cores)) << package;
    }
    for (const std::int64_t core : {3, 4, 5}) {
        expectFieldsElseZero(readCore(799, 160, core), {{64, {2}}});
        EXPECT_EQ(readCore(800, 76, core), Bytes(76, 0));
    }
    EXPECT_EQ(readCore(799, 160, 100)[64], 0);
}

}  // namespace
}  // namespace hostsim_test

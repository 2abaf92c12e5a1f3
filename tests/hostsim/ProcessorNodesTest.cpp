#include <gmock/gmock.h>

#include <functional>
#include <optional>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

using ::testing::StartsWith;

nlohmann::json processorHost(const nlohmann::json &processors, const std::vector<nlohmann::json> &faults = {}) {
    return {{"hostType", "Corlai"}, {"processors", processors}, {"faults", nlohmann::json(faults)}};
}

nlohmann::json packagesOf(const std::vector<nlohmann::json> &packages) {
    return {{"packages", nlohmann::json(packages)}};
}

Bytes word(std::uint32_t value) {
    return {Bytes::value_type(value), Bytes::value_type(value >> 8), Bytes::value_type(value >> 16),
            Bytes::value_type(value >> 24)};
}

// The instance numbers of a node's list; nothing when none is handed out.
std::optional<std::vector<std::int32_t>> servedNumbers(int node, int *status = nullptr) {
    const List list = instanceList(node, status);
    if (!list) return std::nullopt;
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
        {"AuthenticAMD", 0x68747541, 0x69746E65, 0x444D4163},
        {"Odd", 0x0064644F, 0, 0},
    };
    for (const auto &[vendor, ebx, edx, ecx] : vendors) {
        const nlohmann::json cpuid = {{"vendor", vendor},         {"stepping", 255},
                                      {"leaf1Ebx", 0x11223344},   {"leaf1Ecx", "0x55667788"},
                                      {"extendedEcx", "0x99AABBCC"}, {"extendedEdx", 0xDDEEFF00}};
        const nlohmann::json ownCpuid = {{"cpuid", {{"stepping", 3}}}};
        serve(processorHost(packagesOf({{{"cpuid", cpuid}, {"cores", {{{"instance", 7}}, ownCpuid}}}})));
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
        {{{"hardwareThreads", true}}, 605, 36, {{0, word(1)}}},
        {{{"hardwareThreads", "0xdeadbeef"}}, 605, 36, {{0, word(0xdeadbeef)}}},
        {nullptr, 605, 36, {}},
        {{{"modelText", "Xeon"}}, 606, 48, {{0, textField("Xeon", 48)}}},
        {{{"modelText", alphabet.substr(0, 48)}}, 606, 48, {{0, textField(alphabet, 48)}}},
        {{{"modelText", alphabet}}, 606, 48, {{0, textField(alphabet, 48)}}},
        {nullptr, 606, 48, {}},
        {{{"powerPolicy", "Dynamic"}}, 1443, 588, {{8, textField("Dynamic", 580)}}},
        {{{"powerPolicy", std::string(600, 'p')}}, 1443, 588, {{8, Bytes(580, 'p')}}},
        {nullptr, 1443, 588, {}},
    };
    for (const auto &[processors, node, size, fields] : cases) {
        serve(processors.is_null() ? host({}) : processorHost(processors));
        Bytes record(size, 0xa5);
        ASSERT_EQ(PRB_Get(node, nullptr, record.data(), int(size)), HOSTSIM_STATUS_OK) << processors;
        expectFieldsElseZero(record, fields);
        record.assign(size, 0xa5);
        ASSERT_EQ(readNode(node, {}, record), HOSTSIM_STATUS_OK) << "an empty list is no parameters";
    }
}

TEST_F(HostSimProcessorNodes, ListsInProfileOrderWithDefaultNumbersAndCoreCounts) {
    serve(processorHost(packagesOf({
        {{"instance", -5}, {"cores", {{{"instance", 100}}, {{"count", 2}}}}},
        {{"cores", {{{"count", 3}, {"state", 2}}}}},
        {{"instance", "0x10"}, {"coreCount", 12}},
    })));
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

TEST_F(HostSimProcessorNodes, NullPackagesHandBackNoListAndEmptyOnesAnEmptyList) {
    for (const nlohmann::json &packages : {nlohmann::json(nullptr), nlohmann::json::array()}) {
        serve(processorHost({{"packages", packages}}));
        const std::size_t created = HostSim_CreatedListCount();
        int status = -1;
        EXPECT_EQ(servedNumbers(608, &status).has_value(), packages.is_array()) << packages;
        EXPECT_EQ(status, HOSTSIM_STATUS_OK);
        EXPECT_EQ(HostSim_CreatedListCount() - created, packages.is_array() ? 1u : 0u) << packages;
        EXPECT_EQ(servedNumbers(607), std::vector<std::int32_t>{}) << packages;
    }
}

TEST_F(HostSimProcessorNodes, BadRequestsFailAndLeaveTheBufferAlone) {
    const std::tuple<const char *, int, std::vector<Param>, std::size_t, int> cases[] = {
        {"CPUID record one byte short", 607, {std::int64_t{0}}, 199, HOSTSIM_STATUS_BAD_SIZE},
        {"state record one byte long", 799, {std::int64_t{0}}, 161, HOSTSIM_STATUS_BAD_SIZE},
        {"power policy short", 1443, {}, 587, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown core", 607, {std::int64_t{4}}, 200, HOSTSIM_STATUS_NOT_FOUND},
        {"core beyond 32 bits", 799, {std::int64_t{1} << 32}, 160, HOSTSIM_STATUS_NOT_FOUND},
        {"unknown package", 608, {std::int64_t{1}}, 4, HOSTSIM_STATUS_NOT_FOUND},
        {"core named by text", 607, {"0"}, 200, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"no core named", 800, {}, 76, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"two cores", 799, {std::int64_t{0}, std::int64_t{0}}, 160, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"host-wide node with a parameter", 606, {std::int64_t{0}}, 48, HOSTSIM_STATUS_BAD_ARGUMENT},
    };
    serve(processorHost(packagesOf({{{"cores", {{{"count", 4}}}}}})));
    for (const auto &[what, node, params, size, status] : cases) {
        Bytes buffer(size, 0xa5);
        EXPECT_EQ(readNode(node, params, buffer), status) << what;
        EXPECT_EQ(buffer, Bytes(size, 0xa5)) << what;
    }
    const List parent = listOf({std::int64_t{0}});
    PRB_ParamList *list = nullptr;
    EXPECT_EQ(PRB_GetInstanceListAlloc(607, parent.get(), &list), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(list, nullptr);
}

TEST_F(HostSimProcessorNodes, GarbledSectionsAreRefusedNamingTheField) {
    const auto withCores = [](const nlohmann::json &cores) {
        return processorHost(packagesOf({nlohmann::json::object(), {{"cores", cores}}})).dump();
    };
    const std::pair<std::string, std::string> cases[] = {
        {processorHost(nlohmann::json::array()).dump(), "processors: expected an object, got an array"},
        {processorHost(packagesOf({{{"cpuid", {{"vendor", "GenuineIntelX"}}}}})).dump(),
         "processors.packages[0].cpuid.vendor: expected a text of at most 12 bytes"},
        {processorHost(packagesOf({{{"instance", 1}}, nlohmann::json::object()})).dump(),
         "processors.packages[1].instance: duplicate package instance 1"},
        {withCores({{{"state", 256}}}), "processors.packages[1].cores[0].state: expected true, false or an integer"},
        {withCores({{{"instance", 1}}, nlohmann::json::object()}),
         "processors.packages[1].cores[1].instance: duplicate core instance 1"},
        {withCores({{{"instance", 5}, {"count", 2}}}),
         "processors.packages[1].cores[0].instance: cannot be given with a \"count\" above 1"},
        {withCores({{{"instance", 2147483648}}}),
         "processors.packages[1].cores[0].instance: expected an integer from -2147483648 to 2147483647"},
        {withCores({{{"count", 100000}}, nlohmann::json::object()}), "processors: more than 100000 cores"},
    };
    for (const auto &[json, message] : cases) EXPECT_THAT(loadError(json), StartsWith(message)) << json;
}

TEST_F(HostSimProcessorNodes, FaultsSelectProcessorCallsByInstance) {
    using Call = std::function<int()>;
    const auto get = [](int node, std::size_t size, std::int64_t core) -> Call {
        return [=] {
            Bytes buffer(size);
            return readNode(node, {core}, buffer);
        };
    };
    constexpr int ok = HOSTSIM_STATUS_OK;
    constexpr int failed = HOSTSIM_STATUS_INJECTED;
    constexpr int noList = -1;  // success without a list
    const auto list = [](int node) -> Call {
        return [=] {
            int status = -1;
            return servedNumbers(node, &status) || status != ok ? status : noList;
        };
    };
    const Call readSecondCore = [] {
        std::int32_t core = 0;
        return PRB_ParamListGetInt32(instanceList(607).get(), 1, &core);
    };
    const std::tuple<nlohmann::json, std::vector<Call>, std::vector<int>> cases[] = {
        {{{"call", "PRB_Get"}, {"node", 607}, {"instance", 2}},
         {get(607, 200, 1), get(607, 200, 2), get(799, 160, 2)},
         {ok, failed, ok}},
        {{{"call", "PRB_Get"}, {"node", 799}, {"instance", "3"}}, {get(799, 160, 3), get(800, 76, 3)}, {failed, ok}},
        {{{"call", "PRB_Get"}, {"node", 608}}, {get(608, 4, 0), get(607, 200, 0)}, {failed, ok}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"node", 608}}, {list(608), list(607)}, {failed, ok}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"node", 607}, {"noList", true}}, {list(607), list(608)}, {noList, ok}},
        {{{"call", "PRB_ParamListGetInt32"}, {"index", 1}}, {readSecondCore}, {failed}},
    };
    for (const auto &[rule, calls, statuses] : cases) {
        const nlohmann::json twoCores = {{"cores", {{{"count", 2}}}}};
        serve(processorHost(packagesOf({twoCores, twoCores}), {rule}));
        std::vector<int> got;
        for (const Call &call : calls) got.push_back(call());
        EXPECT_EQ(got, statuses) << rule;
    }
}

}  // namespace
}  // namespace hostsim_test

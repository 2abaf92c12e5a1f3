#include <functional>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

// One platform call; returns the status it got (INJECTED for a null list).
using PlatformCall = std::function<int()>;

constexpr int ok = HOSTSIM_STATUS_OK;
constexpr int failed = HOSTSIM_STATUS_INJECTED;
constexpr int noList = -1;  // success without a list

PlatformCall get(int node, std::size_t size, const Param &instance) {
    return [=] {
        Bytes buffer(size);
        return readNode(node, {instance}, buffer);
    };
}

PlatformCall list(int node) {
    return [=] {
        int status = -1;
        return instanceList(node, &status) || status != ok ? status : noList;
    };
}

// An entry of a list of three.
PlatformCall param(int index) {
    return [=] {
        const List list = listOf({"vmk0", "vmk1", "vmk2"});
        return PRB_ParamListGetParam(list.get(), index) != nullptr ? ok : failed;
    };
}

const PlatformCall checkSig = [] {
    char area[21];
    return PRB_CheckSig(area, sizeof area, nullptr);
};

class HostSimFaults : public HostSimTest {
protected:
    // Adapters vmnic0 and vmnic1; two packages of two cores, numbered 0 to 3.
    void serveWith(const nlohmann::json &rule) {
        const nlohmann::json twoCores = {{"cores", {{{"count", 2}}}}};
        serve(host({{{"name", "vmnic0"}}, {{"name", "vmnic1"}}}, {rule},
                   {{"packages", std::vector<nlohmann::json>{twoCores, twoCores}}}));
    }
};

// Which list-handling calls fail is left to the inventories' tests, whose
// faults name texts, values and indexes and count the records kept. The
// nth-call cases come after others of the same call, so they fail unless
// loading a profile restarts the count.
TEST_F(HostSimFaults, EachRuleFailsExactlyTheCallsItNames) {
    const std::tuple<nlohmann::json, std::vector<PlatformCall>, std::vector<int>> cases[] = {
        {{{"call", "PRB_Get"}, {"node", 72}, {"instance", "vmnic1"}},
         {get(72, 1252, "vmnic0"), get(72, 1252, "vmnic1"), get(74, 4, "vmnic1"), get(72, 1252, "vmnic1")},
         {ok, failed, ok, failed}},
        {{{"call", "PRB_Get"}, {"node", 74}, {"nth", 2}},
         {get(74, 4, "vmnic0"), get(72, 1252, "vmnic0"), get(74, 4, "vmnic1"), get(74, 4, "vmnic0")},
         {ok, ok, failed, ok}},
        {{{"call", "PRB_Get"}, {"node", 799}, {"instance", "3"}},
         {get(799, 160, std::int64_t{3}), get(800, 76, std::int64_t{3}), get(799, 160, std::int64_t{2})},
         {failed, ok, ok}},
        {{{"call", "PRB_CheckSig"}}, {checkSig, checkSig}, {failed, failed}},
        {{{"call", "PRB_CheckSig"}, {"nth", 1}}, {checkSig, checkSig}, {failed, ok}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"node", 608}}, {list(608), list(607)}, {failed, ok}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"node", 607}, {"noList", true}}, {list(607), list(608)}, {noList, ok}},
        {{{"call", "PRB_ParamListGetParam"}, {"index", 1}}, {param(0), param(1), param(2), param(1)},
         {ok, failed, ok, failed}},
    };
    for (const auto &[rule, calls, statuses] : cases) {
        serveWith(rule);
        std::vector<int> got;
        for (const PlatformCall &call : calls) got.push_back(call());
        EXPECT_EQ(got, statuses) << rule;
    }
}

}  // namespace
}  // namespace hostsim_test

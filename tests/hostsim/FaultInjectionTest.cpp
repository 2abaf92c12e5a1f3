#include <functional>

#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

// One platform call; returns the status it got (INJECTED for a null list).
using PlatformCall = std::function<int()>;

PlatformCall get(int node, const char *adapter) {
    return [=] {
        Bytes buffer(node == 72 ? 1252 : 4);
        return readNode(node, {adapter}, buffer);
    };
}

const PlatformCall checkSig = [] {
    char area[21];
    return PRB_CheckSig(area, sizeof area, nullptr);
};
const PlatformCall create = [] { return List(PRB_ParamListCreate(1, 1)) ? 0 : HOSTSIM_STATUS_INJECTED; };
const PlatformCall listAdapters = [] {
    int status = -1;
    instanceList(70, &status);
    return status;
};

PlatformCall addString(const char *text) {
    return [=] { return PRB_ParamListAddString(listOf({}).get(), text); };
}

PlatformCall addInt(int64_t value) {
    return [=] { return PRB_ParamListAddInt(listOf({}).get(), value); };
}

PlatformCall getString(int index) {
    return [=] {
        char *text = nullptr;
        return PRB_ParamListGetString(instanceList(70).get(), index, &text);
    };
}

PlatformCall getInt32(int index) {
    return [=] {
        const List list = listOf({});
        PRB_ParamListAddInt(list.get(), 1);
        PRB_ParamListAddInt(list.get(), 2);
        int32_t value = 0;
        return PRB_ParamListGetInt32(list.get(), index, &value);
    };
}

constexpr int ok = HOSTSIM_STATUS_OK;
constexpr int failed = HOSTSIM_STATUS_INJECTED;

class HostSimFaults : public HostSimTest {};

TEST_F(HostSimFaults, EachRuleFailsExactlyTheCallsItNames) {
    const std::tuple<nlohmann::json, std::vector<PlatformCall>, std::vector<int>> cases[] = {
        {{{"call", "PRB_Get"}, {"node", 72}, {"instance", "vmnic1"}},
         {get(72, "vmnic0"), get(72, "vmnic1"), get(74, "vmnic1"), get(72, "vmnic1")},
         {ok, failed, ok, failed}},
        {{{"call", "PRB_Get"}, {"node", 74}, {"nth", 2}},
         {get(74, "vmnic0"), get(72, "vmnic0"), get(74, "vmnic1"), get(74, "vmnic0")},
         {ok, ok, failed, ok}},
        {{{"call", "PRB_CheckSig"}}, {checkSig, checkSig}, {failed, failed}},
        {{{"call", "PRB_CheckSig"}, {"nth", 1}}, {checkSig, checkSig}, {failed, ok}},
        {{{"call", "PRB_ParamListCreate"}, {"nth", 2}}, {create, create, create}, {ok, failed, ok}},
        {{{"call", "PRB_ParamListAddString"}, {"text", "vmnic1"}},
         {addString("vmnic0"), addString("vmnic1")},
         {ok, failed}},
        {{{"call", "PRB_ParamListAddInt"}, {"value", -1}}, {addInt(-1), addInt(1)}, {failed, ok}},
        {{{"call", "PRB_ParamListGetString"}, {"index", 1}},
         {getString(0), getString(1), getString(0)},
         {ok, failed, ok}},
        {{{"call", "PRB_ParamListGetInt32"}, {"index", 0}}, {getInt32(0), getInt32(1)}, {failed, ok}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"node", 70}}, {listAdapters}, {failed}},
        {{{"call", "PRB_GetInstanceListAlloc"}, {"noList", true}}, {listAdapters}, {ok}},
    };
    for (const auto &[rule, calls, statuses] : cases) {
        serve(host({{{"name", "vmnic0"}}, {{"name", "vmnic1"}}}, {rule}));
        const std::size_t created = HostSim_CreatedListCount();
        std::vector<int> got;
        for (const PlatformCall &call : calls) got.push_back(call());
        EXPECT_EQ(got, statuses) << rule;
        if (rule.contains("noList")) {
            EXPECT_EQ(HostSim_CreatedListCount(), created) << "no list handed out";
        }
    }
}

TEST_F(HostSimFaults, LoadingAProfileRestartsTheCallCount) {
    const nlohmann::json profile = host({}, {{{"call", "PRB_CheckSig"}, {"nth", 2}}});
    serve(profile);
    EXPECT_EQ(checkSig(), ok);
    serve(profile);
    EXPECT_EQ(checkSig(), ok);
    EXPECT_EQ(checkSig(), failed);
}

}  // namespace
}  // namespace hostsim_test

#include "HostSimTesting.h"

namespace hostsim_test {

List listOf(const std::vector<std::string> &texts) {
    List list(PRB_ParamListCreate(1, 1));
    for (const std::string &text : texts) EXPECT_EQ(PRB_ParamListAddString(list.get(), text.c_str()), 0);
    return list;
}

List instanceList(int node, int *status) {
    PRB_ParamList *list = nullptr;
    const int result = PRB_GetInstanceListAlloc(node, nullptr, &list);
    if (status != nullptr) *status = result;
    return List(list);
}

std::vector<std::string> servedAdapterNames() {
    std::vector<std::string> names;
    const List list = instanceList(70);
    for (int i = 0; i < PRB_ParamListUsedCount(list.get()); ++i) {
        char *name = nullptr;
        EXPECT_EQ(PRB_ParamListGetString(list.get(), i, &name), 0);
        names.push_back(name);
    }
    return names;
}

int readNode(int node, const std::vector<std::string> &params, Bytes &buffer) {
    const List list = listOf(params);
    return PRB_Get(node, list.get(), buffer.data(), int(buffer.size()));
}

nlohmann::json host(const std::vector<nlohmann::json> &adapters, const std::vector<nlohmann::json> &faults) {
    return {{"hostType", "Corlai"}, {"adapters", nlohmann::json(adapters)}, {"faults", nlohmann::json(faults)}};
}

std::string loadError(const std::string &json) {
    char error[512] = "untouched";
    HostSim_LoadProfileText(json.c_str(), error, sizeof error);
    return error;
}

void HostSimTest::TearDown() {
    HostSim_ResetProfile();
    EXPECT_EQ(HostSim_LiveListCount(), liveBefore_) << "the test left a list alive";
}

}  // namespace hostsim_test

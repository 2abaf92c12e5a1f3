#include "HostSimTesting.h"

#include <algorithm>
#include <cstring>

namespace hostsim_test {

List listOf(const std::vector<Param> &params) {
    List list(PRB_ParamListCreate(1, 1));
    for (const Param &param : params) {
        if (const auto *text = std::get_if<std::string>(&param)) {
            EXPECT_EQ(PRB_ParamListAddString(list.get(), text->c_str()), 0);
        } else {
            EXPECT_EQ(PRB_ParamListAddInt(list.get(), std::get<std::int64_t>(param)), 0);
        }
    }
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

int readNode(int node, const std::vector<Param> &params, Bytes &buffer) {
    const List list = listOf(params);
    return PRB_Get(node, list.get(), buffer.data(), int(buffer.size()));
}

Bytes textField(const std::string &text, std::size_t width) {
    Bytes bytes(width, 0);
    std::memcpy(bytes.data(), text.data(), std::min(width, text.size()));
    return bytes;
}

void expectFieldsElseZero(const Bytes &record, const Fields &fields) {
    std::vector<bool> inField(record.size(), false);
    for (const auto &[offset, bytes] : fields) {
        EXPECT_EQ(Bytes(record.begin() + offset, record.begin() + offset + bytes.size()), bytes) << offset;
        std::fill_n(inField.begin() + offset, bytes.size(), true);
    }
    for (std::size_t i = 0; i < record.size(); ++i) {
        EXPECT_TRUE(inField[i] || record[i] == 0) << "byte " << i << " belongs to no field";
    }
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

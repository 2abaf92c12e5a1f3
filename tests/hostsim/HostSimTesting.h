// Shared pieces of the stand-in's tests: owned lists, profile building, and
// a fixture that proves every test frees the lists it was handed.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <string>
#include <variant>
#include <vector>

#include <nlohmann/json.hpp>

#include "hostsim/HostSimControl.h"
#include "platform/OskSysInfo.h"
#include "platform/OskUser.h"

namespace hostsim_test {

struct ListDestroyer {
    void operator()(PRB_ParamList *list) const { PRB_ParamListDestroy(list); }
};
using List = std::unique_ptr<PRB_ParamList, ListDestroyer>;
using Bytes = std::vector<unsigned char>;
using Param = std::variant<std::string, std::int64_t>;

inline List listOf(const std::vector<Param> &params) {
    List list(PRB_ParamListCreate(1, 1));
    for (const Param &param : params) {
        const auto *text = std::get_if<std::string>(&param);
        EXPECT_EQ(text ? PRB_ParamListAddString(list.get(), text->c_str())
                       : PRB_ParamListAddInt(list.get(), std::get<std::int64_t>(param)),
                  0);
    }
    return list;
}

inline std::vector<std::string> adapterNames() {
    PRB_ParamList *listed = nullptr;
    EXPECT_EQ(PRB_GetInstanceListAlloc(70, nullptr, &listed), 0);
    const List list(listed);
    std::vector<std::string> names;
    for (int i = 0; i < PRB_ParamListUsedCount(list.get()); ++i) {
        char *name = nullptr;
        EXPECT_EQ(PRB_ParamListGetString(list.get(), i, &name), 0);
        names.push_back(name == nullptr ? "" : name);
    }
    return names;
}

inline int readNode(int node, const std::vector<Param> &params, Bytes &buffer) {
    const List list = listOf(params);
    return PRB_Get(node, list.get(), buffer.data(), int(buffer.size()));
}

// A "Corlai" host. A vector, since a braced single json would not become an array.
inline nlohmann::json host(const std::vector<nlohmann::json> &adapters) {
    return {{"hostType", "Corlai"}, {"adapters", adapters}};
}

// The loader's error, empty when the profile was loaded.
inline std::string loadError(const std::string &json) {
    char error[512] = "untouched";
    HostSim_LoadProfileText(json.c_str(), error, sizeof error);
    return error;
}

class HostSimTest : public ::testing::Test {
protected:
    void SetUp() override { liveBefore_ = HostSim_LiveListCount(); }
    void TearDown() override {
        HostSim_ResetProfile();
        EXPECT_EQ(HostSim_LiveListCount(), liveBefore_) << "the test left a list alive";
    }
    void serve(const nlohmann::json &profile) { ASSERT_EQ(loadError(profile.dump()), ""); }

private:
    std::size_t liveBefore_ = 0;
};

}  // namespace hostsim_test

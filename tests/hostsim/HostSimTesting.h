// Shared pieces of the stand-in's tests: owned lists, profile building, and
// a fixture that proves every test frees the lists it was handed.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <utility>
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
        if (const auto *text = std::get_if<std::string>(&param)) {
            EXPECT_EQ(PRB_ParamListAddString(list.get(), text->c_str()), 0);
        } else {
            EXPECT_EQ(PRB_ParamListAddInt(list.get(), std::get<std::int64_t>(param)), 0);
        }
    }
    return list;
}

inline List instanceList(int node, int *status = nullptr) {
    PRB_ParamList *list = nullptr;
    const int result = PRB_GetInstanceListAlloc(node, nullptr, &list);
    if (status != nullptr) *status = result;
    return List(list);
}

inline std::vector<std::string> servedAdapterNames() {
    std::vector<std::string> names;
    const List list = instanceList(70);
    for (int i = 0; i < PRB_ParamListUsedCount(list.get()); ++i) {
        char *name = nullptr;
        EXPECT_EQ(PRB_ParamListGetString(list.get(), i, &name), 0);
        names.push_back(name);
    }
    return names;
}

// PRB_Get of `node` for a list of `params` into `buffer`.
inline int readNode(int node, const std::vector<Param> &params, Bytes &buffer) {
    const List list = listOf(params);
    return PRB_Get(node, list.get(), buffer.data(), int(buffer.size()));
}

// A record field holding `text`: zero-padded, or cut to `width`.
inline Bytes textField(const std::string &text, std::size_t width) {
    Bytes bytes(width, 0);
    std::memcpy(bytes.data(), text.data(), std::min(width, text.size()));
    return bytes;
}

// Offset and bytes of each field of a record.
using Fields = std::vector<std::pair<std::size_t, Bytes>>;

// Each field holds its bytes, and every byte of no field is zero.
inline void expectFieldsElseZero(const Bytes &record, const Fields &fields) {
    std::vector<bool> inField(record.size(), false);
    for (const auto &[offset, bytes] : fields) {
        EXPECT_EQ(Bytes(record.begin() + offset, record.begin() + offset + bytes.size()), bytes) << offset;
        std::fill_n(inField.begin() + offset, bytes.size(), true);
    }
    for (std::size_t i = 0; i < record.size(); ++i) {
        EXPECT_TRUE(inField[i] || record[i] == 0) << "byte " << i << " belongs to no field";
    }
}

// A "Corlai" host. Vectors, since a braced single json would not become an array.
inline nlohmann::json host(const std::vector<nlohmann::json> &adapters, const std::vector<nlohmann::json> &faults = {},
                           const nlohmann::json &processors = nullptr) {
    nlohmann::json profile = {{"hostType", "Corlai"}, {"adapters", adapters}, {"faults", faults}};
    if (!processors.is_null()) profile["processors"] = processors;
    return profile;
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

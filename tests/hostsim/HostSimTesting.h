// Shared pieces of the stand-in's tests: owned lists, profile building, and
// a fixture that proves every test frees the lists it was handed.
#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
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

List listOf(const std::vector<Param> &params);
List instanceList(int node, int *status = nullptr);
std::vector<std::string> servedAdapterNames();
// PRB_Get of `node` for a list of `params` into `buffer`.
int readNode(int node, const std::vector<Param> &params, Bytes &buffer);

// A record field holding `text`: zero-padded, or cut to `width`.
Bytes textField(const std::string &text, std::size_t width);
// Offset and bytes of each field of a record.
using Fields = std::vector<std::pair<std::size_t, Bytes>>;
// Each field holds its bytes, and every byte of no field is zero.
void expectFieldsElseZero(const Bytes &record, const Fields &fields);

// A "Corlai" host. Vectors, since a braced single json would not become an array.
nlohmann::json host(const std::vector<nlohmann::json> &adapters, const std::vector<nlohmann::json> &faults = {});
// The loader's error, empty when the profile was loaded.
std::string loadError(const std::string &json);

class HostSimTest : public ::testing::Test {
protected:
    void SetUp() override { liveBefore_ = HostSim_LiveListCount(); }
    void TearDown() override;
    void serve(const nlohmann::json &profile) { ASSERT_EQ(loadError(profile.dump()), ""); }

private:
    std::size_t liveBefore_ = 0;
};

}  // namespace hostsim_test

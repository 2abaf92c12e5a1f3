// Shared pieces of the stand-in's tests: owned lists, profile building, and
// a fixture that proves every test frees the lists it was handed.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>
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

List listOf(const std::vector<std::string> &texts);
List instanceList(int node, int *status = nullptr);
std::vector<std::string> servedAdapterNames();
// PRB_Get of `node` for a list of `params` into `buffer`.
int readNode(int node, const std::vector<std::string> &params, Bytes &buffer);

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

// tvxcim listen on the test providers, whose Test_Event arrives every few
// milliseconds once enabled: every indication printed as it came, one JSON
// object a line, until --seconds have passed. Listen writes through the same
// writers as the other commands, so the MOF form is covered there.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;

TEST(TvxcimListen, PrintsEachIndicationInOrderUntilTheSecondsHavePassed) {
    const Outcome run = runOnTestProviders({"--json", "--seconds", "0.5", "listen"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(run.err, "");
    std::vector<std::uint64_t> sequences;
    for (const std::string &line : lines(run.out)) {
        const nlohmann::json indication = nlohmann::json::parse(line);
        EXPECT_EQ(indication["className"], "Test_Event");
        EXPECT_EQ(indication["properties"]["Sequence"]["type"], "uint32");
        sequences.push_back(indication["properties"]["Sequence"]["value"].get<std::uint64_t>());
    }
    // Each event once, in order, none lost.
    EXPECT_GE(sequences.size(), 2U) << "listen stopped after the first indication";
    for (std::size_t i = 0; i < sequences.size(); ++i) EXPECT_EQ(sequences[i], i);
}

}  // namespace

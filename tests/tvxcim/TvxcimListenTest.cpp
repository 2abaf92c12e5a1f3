// tvxcim listen on the test providers, whose Test_Event arrives every few
// milliseconds once enabled: every indication printed as it came, in MOF
// or as one JSON object a line, until --seconds have passed.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;
using testing::StartsWith;

// Sequence numbers as they were printed: each event once, in order, none lost.
void expectInOrderFromZero(const std::vector<std::uint64_t> &sequences) {
    EXPECT_GE(sequences.size(), 2U) << "listen stopped after the first indication";
    for (std::size_t i = 0; i < sequences.size(); ++i) EXPECT_EQ(sequences[i], i);
}

TEST(TvxcimListen, PrintsEachIndicationInMofUntilTheSecondsHavePassed) {
    const Outcome run = runOnTestProviders({"listen", "--seconds", "0.5"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(run.err, "");
    EXPECT_THAT(run.out, StartsWith("// root/cimv2:Test_Event\ninstance of Test_Event\n{\n    Sequence = 0;\n"
                                    "    Origin = \"EventProvider\";\n    EventTime = \""));
    std::vector<std::uint64_t> sequences;
    for (const std::string &line : lines(run.out)) {
        if (line.rfind("    Sequence = ", 0) == 0) sequences.push_back(std::stoull(line.substr(15)));
    }
    expectInOrderFromZero(sequences);
}

TEST(TvxcimListen, WritesOneJsonObjectPerIndication) {
    const Outcome run = runOnTestProviders({"--json", "--seconds", "0.5", "listen"});
    ASSERT_EQ(run.status, 0) << run.err;
    std::vector<std::uint64_t> sequences;
    for (const std::string &line : lines(run.out)) {
        const nlohmann::json indication = nlohmann::json::parse(line);
        EXPECT_EQ(indication["className"], "Test_Event");
        EXPECT_EQ(indication["properties"]["Sequence"]["type"], "uint32");
        sequences.push_back(indication["properties"]["Sequence"]["value"].get<std::uint64_t>());
    }
    expectInOrderFromZero(sequences);
}

}  // namespace

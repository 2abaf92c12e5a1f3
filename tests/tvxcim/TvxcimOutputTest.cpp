// What each command prints for representative test provider instances, in
// MOF and as JSON, and the demo's sections. Listen and the demo's
// indications are checked on the built-in host (tests/e2e).
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;
using Json = nlohmann::ordered_json;

// Which command asks the broker for what, and each answer in MOF; how each
// value kind is written in MOF is the model's own test.
TEST(TvxcimOutputTest, MofPrintsInstancesAsMofAndPathsAsText) {
    const std::pair<Args, std::string> cases[] = {
        {{"--properties", "Tags,Size,Enabled", "gi", kAlpha},
         "// " + std::string(kAlpha) + "\ninstance of Test_Widget\n{\n    Name = \"alpha\";\n    Size = 1;\n"
         "    Tags = {\"test\", \"alpha\"};\n    Enabled = TRUE;\n};\n\n"},
        {{"ein", "root/cimv2:test_specialwidget"}, "root/cimv2:Test_SpecialWidget.Name=\"gamma\"\n"},
        {{"ain", kGadgetAlpha}, std::string(kAlpha) + "\n"},
        {{"--result-class", "Test_Widget", "ain", kAlpha}, ""},
    };
    for (const auto &[args, out] : cases) {
        const Outcome run = runOnTestProviders(args);
        EXPECT_EQ(run.err, "") << testing::PrintToString(args);
        EXPECT_EQ(run.out, out) << testing::PrintToString(args);
        EXPECT_EQ(run.status, 0) << testing::PrintToString(args);
    }
}

// Each line parsed on its own, so that an object spread over lines fails.
std::vector<Json> jsonLines(const std::string &text) {
    std::vector<Json> objects;
    for (const std::string &line : lines(text)) objects.push_back(Json::parse(line));
    return objects;
}

const Json kAlphaPath = Json::parse(R"({"text":"root/cimv2:Test_Widget.Name=\"alpha\"","namespace":"root/cimv2",
    "className":"Test_Widget","keys":{"Name":{"type":"string","value":"alpha"}}})");
const Json kGadgetAlphaPath = Json::parse(R"({"text":"root/cimv2:Test_Gadget.Id=\"gadget-alpha\"",
    "namespace":"root/cimv2","className":"Test_Gadget","keys":{"Id":{"type":"string","value":"gadget-alpha"}}})");

// An association instance shows every shape at once: the instance, its path,
// and reference values as keys and as properties. Value kinds are the
// InstanceJson test's.
TEST(TvxcimOutputTest, JsonPrintsOneObjectPerLine) {
    const Outcome run = runOnTestProviders({"--json", "--properties", "Part", "ri", kGadgetAlpha});
    ASSERT_EQ(run.status, 0) << run.err;
    const std::vector<Json> objects = jsonLines(run.out);
    ASSERT_EQ(objects.size(), 1U) << run.out;
    const Json references = {{"Owner", {{"type", "reference"}, {"value", kAlphaPath}}},
                             {"Part", {{"type", "reference"}, {"value", kGadgetAlphaPath}}}};
    EXPECT_EQ(objects[0]["className"], "Test_WidgetGadget");
    EXPECT_EQ(objects[0]["path"]["keys"], references);
    EXPECT_EQ(objects[0]["properties"], references);
}

// The demo goes on past a section that fails, showing the failure in place
// and, from the broker, once on stderr; the MOF form is checked end to end
// on the built-in host (tests/e2e/check_demo.cmake).
TEST(TvxcimDemoTest, JsonWritesEachSectionAsOneObject) {
    const Outcome run = runOnTestProviders({"--json", "demo"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(lines(run.err).size(), 4U) << run.err;
    const std::vector<Json> sections = jsonLines(run.out);
    ASSERT_EQ(sections.size(), 11U);
    EXPECT_EQ(sections[4]["className"], "Test_Missing");
    EXPECT_EQ(sections[4]["error"]["rcName"], "CMPI_RC_ERR_FAILED");
    EXPECT_EQ(sections[8]["names"], Json::array({kGadgetAlphaPath})) << "ain of widget alpha";
}

}  // namespace

// What each command prints for representative test provider instances, in
// MOF and as JSON, and the demo's sections in both forms. The whole of an
// instance shows in the JSON cases; how each value kind is written in MOF is
// the model's own test.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;
using testing::HasSubstr;
using Json = nlohmann::ordered_json;

const std::string kLinkAlpha =
    R"(root/cimv2:Test_WidgetGadget.Owner="root/cimv2:Test_Widget.Name=\"alpha\"",)"
    R"(Part="root/cimv2:Test_Gadget.Id=\"gadget-alpha\"")";

struct OutputCase {
    const char *name;
    Args args;
    std::string out;
};

void PrintTo(const OutputCase &test, std::ostream *os) { *os << test.name; }

class MofOutputTest : public testing::TestWithParam<OutputCase> {};

TEST_P(MofOutputTest, PrintsInstancesAsMofAndPathsAsText) {
    const Outcome run = runOnTestProviders(GetParam().args);
    EXPECT_EQ(run.err, "");
    EXPECT_EQ(run.out, GetParam().out);
    EXPECT_EQ(run.status, 0);
}

INSTANTIATE_TEST_SUITE_P(
    Commands, MofOutputTest,
    testing::Values(
        OutputCase{"GetInstanceWithPropertyList", {"--properties", "Tags", "gi", kAlpha},
                   "// " + std::string(kAlpha) +
                       "\ninstance of Test_Widget\n{\n    Name = \"alpha\";\n    Tags = {\"test\", \"alpha\"};\n};\n\n"},
        OutputCase{"Enumerate", {"--properties", "Size,Enabled", "ei", "Test_SpecialWidget"},
                   "// root/cimv2:Test_SpecialWidget.Name=\"gamma\"\ninstance of Test_SpecialWidget\n{\n"
                   "    Name = \"gamma\";\n    Size = 3;\n    Enabled = TRUE;\n};\n\n"},
        OutputCase{"EnumerateSubclassInOtherSpelling", {"ein", "root/cimv2:test_specialwidget"},
                   "root/cimv2:Test_SpecialWidget.Name=\"gamma\"\n"},
        OutputCase{"AssociatorNames", {"ain", kGadgetAlpha}, std::string(kAlpha) + "\n"},
        OutputCase{"AssociatorsWithPropertyList",
                   {"--properties", "WidgetName", "ai", kAlpha},
                   "// root/cimv2:Test_Gadget.Id=\"gadget-alpha\"\ninstance of Test_Gadget\n{\n"
                   "    Id = \"gadget-alpha\";\n    WidgetName = \"alpha\";\n};\n\n"},
        OutputCase{"ReferenceNames", {"rin", kGadgetAlpha}, kLinkAlpha + "\n"},
        OutputCase{"References",
                   {"ri", kAlpha},
                   "// " + kLinkAlpha + "\ninstance of Test_WidgetGadget\n{\n"
                   "    Owner = \"root/cimv2:Test_Widget.Name=\\\"alpha\\\"\";\n"
                   "    Part = \"root/cimv2:Test_Gadget.Id=\\\"gadget-alpha\\\"\";\n};\n\n"},
        OutputCase{"NothingAssociatedWithFilter", {"--result-class", "Test_Widget", "ain", kAlpha}, ""}),
    [](const auto &test) { return std::string(test.param.name); });

// Each line parsed on its own, so that an object spread over lines fails.
std::vector<Json> jsonLines(const std::string &text) {
    std::vector<Json> objects;
    for (const std::string &line : lines(text)) objects.push_back(Json::parse(line));
    return objects;
}

const char *const kAlphaPathJson = R"({"text":"root/cimv2:Test_Widget.Name=\"alpha\"","namespace":"root/cimv2",
    "className":"Test_Widget","keys":{"Name":{"type":"string","value":"alpha"}}})";
const char *const kGadgetAlphaPathJson = R"({"text":"root/cimv2:Test_Gadget.Id=\"gadget-alpha\"",
    "namespace":"root/cimv2","className":"Test_Gadget","keys":{"Id":{"type":"string","value":"gadget-alpha"}}})";

std::string withAlphaAndGadget(const std::string &pattern) {
    std::string text = pattern;
    for (const auto &[marker, json] : {std::pair{"$ALPHA", kAlphaPathJson}, std::pair{"$GADGET", kGadgetAlphaPathJson}}) {
        const std::string name = marker;
        for (std::size_t at; (at = text.find(name)) != std::string::npos;) text.replace(at, name.size(), json);
    }
    return text;
}

class JsonOutputTest : public testing::TestWithParam<OutputCase> {};

// `out` holds the one expected object, with $ALPHA and $GADGET standing for
// the paths of widget alpha and its gadget. Which command asks the broker for
// what shows in the MOF cases; these cover the shapes of instances, paths and
// reference values.
TEST_P(JsonOutputTest, PrintsOneObjectPerLine) {
    const Outcome run = runOnTestProviders(GetParam().args);
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(jsonLines(run.out), std::vector<Json>{Json::parse(withAlphaAndGadget(GetParam().out))});
}

INSTANTIATE_TEST_SUITE_P(
    Commands, JsonOutputTest,
    testing::Values(
        OutputCase{"GetInstance", {"--json", "gi", kAlpha},
                   R"({"className":"Test_Widget","path":$ALPHA,"properties":{
                       "Name":{"type":"string","value":"alpha"},
                       "Caption":{"type":"string","value":"Widget alpha"},
                       "Size":{"type":"uint32","value":1},
                       "Tags":{"type":"string[]","value":["test","alpha"]},
                       "Created":{"type":"datetime","value":"20200101000001.000000+000"},
                       "Enabled":{"type":"boolean","value":true}}})"},
        OutputCase{"AssociatorNames", {"--json", "ain", kAlpha}, "$GADGET"},
        OutputCase{"References", {"--json", "--properties", "Part", "ri", kGadgetAlpha},
                   R"({"className":"Test_WidgetGadget","path":{"text":)" + Json(kLinkAlpha).dump() +
                       R"(,"namespace":"root/cimv2","className":"Test_WidgetGadget","keys":{
                       "Owner":{"type":"reference","value":$ALPHA},
                       "Part":{"type":"reference","value":$GADGET}}},
                       "properties":{"Owner":{"type":"reference","value":$ALPHA},
                       "Part":{"type":"reference","value":$GADGET}}})"}),
    [](const auto &test) { return std::string(test.param.name); });

// Which sections the demo shows, and in what order, is checked in the JSON
// form below; the MOF headings, instances and first indication on the
// built-in host are checked end to end (tests/e2e/check_demo.cmake).
TEST(TvxcimDemoTest, MofShowsFailuresInPlace) {
    const Outcome run = runOnTestProviders({"--seconds", "60", "demo"});
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_THAT(run.out, HasSubstr("== ei Test_Missing\n   CMPI_RC_ERR_FAILED (1): provider MissingLib: "));
}

TEST(TvxcimDemoTest, JsonWritesEachSectionAsOneObject) {
    const Outcome run = runOnTestProviders({"--json", "--seconds", "60", "demo"});
    ASSERT_EQ(run.status, 0) << run.err;
    // Failures shown in place in the output, and by the broker once each on stderr.
    EXPECT_EQ(lines(run.err).size(), 4U) << run.err;
    const std::vector<Json> sections = jsonLines(run.out);
    ASSERT_EQ(sections.size(), 14U);
    EXPECT_EQ(sections[0]["section"], "ei");
    EXPECT_EQ(sections[0]["instances"].size(), 3U);
    EXPECT_EQ(sections[6]["className"], "Test_Missing");
    EXPECT_EQ(sections[6]["error"]["rcName"], "CMPI_RC_ERR_FAILED");
    EXPECT_THAT(sections[6]["error"]["message"].get<std::string>(), HasSubstr("libtvxnosuchlibrary.so"));
    EXPECT_EQ(sections[10]["section"], "ain");
    EXPECT_EQ(sections[10]["path"], Json::parse(kAlphaPathJson));
    EXPECT_EQ(sections[10]["names"], Json::array({Json::parse(kGadgetAlphaPathJson)}));
    const Json &indication = sections[13];
    EXPECT_EQ(indication["section"], "first indication");
    EXPECT_EQ(indication["indication"]["className"], "Test_Event");
    EXPECT_EQ(indication["indication"]["properties"]["Sequence"], Json::parse(R"({"type":"uint32","value":0})"));
}

}  // namespace

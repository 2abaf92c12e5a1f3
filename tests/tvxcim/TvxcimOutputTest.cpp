// What each command prints for representative test provider instances, in
// MOF and as JSON, and the demo's sections in both forms.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;
using testing::ElementsAre;
using testing::HasSubstr;
using Json = nlohmann::ordered_json;

const std::string kAlphaMof = R"(// root/cimv2:Test_Widget.Name="alpha"
instance of Test_Widget
{
    Name = "alpha";
    Caption = "Widget alpha";
    Size = 1;
    Tags = {"test", "alpha"};
    Created = "20200101000001.000000+000";
    Enabled = TRUE;
};

)";

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
        OutputCase{"GetInstance", {"gi", kAlpha}, kAlphaMof},
        OutputCase{"Enumerate", {"--properties", "Size,Enabled", "ei", "Test_SpecialWidget"},
                   "// root/cimv2:Test_SpecialWidget.Name=\"gamma\"\ninstance of Test_SpecialWidget\n{\n"
                   "    Size = 3;\n    Enabled = TRUE;\n};\n\n"},
        OutputCase{"EnumerateSubclassInOtherSpelling", {"ein", "root/cimv2:test_specialwidget"},
                   "root/cimv2:Test_SpecialWidget.Name=\"gamma\"\n"},
        OutputCase{"AssociatorNames", {"ain", kGadgetAlpha}, std::string(kAlpha) + "\n"},
        OutputCase{"AssociatorsWithPropertyList",
                   {"--properties", "WidgetName", "ai", kAlpha},
                   "// root/cimv2:Test_Gadget.Id=\"gadget-alpha\"\ninstance of Test_Gadget\n{\n"
                   "    WidgetName = \"alpha\";\n};\n\n"},
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

// Whitespace-separated JSON values, laid out as a reader finds clearest.
std::vector<Json> jsonValues(const std::string &text) {
    std::vector<Json> values;
    std::istringstream stream(text);
    while (!(stream >> std::ws).eof()) {
        Json value;
        stream >> value;
        values.push_back(std::move(value));
    }
    return values;
}

const char *const kAlphaPathJson = R"({"text":"root/cimv2:Test_Widget.Name=\"alpha\"","namespace":"root/cimv2",
    "className":"Test_Widget","keys":{"Name":{"type":"string","value":"alpha"}}})";
const char *const kGammaPathJson = R"({"text":"root/cimv2:Test_SpecialWidget.Name=\"gamma\"",
    "namespace":"root/cimv2","className":"Test_SpecialWidget","keys":{"Name":{"type":"string","value":"gamma"}}})";
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

// `out` holds the expected objects, with $ALPHA and $GADGET
// standing for the paths of widget alpha and its gadget.
TEST_P(JsonOutputTest, PrintsOneObjectPerLine) {
    Args args = {"--json"};
    args.insert(args.end(), GetParam().args.begin(), GetParam().args.end());
    const Outcome run = runOnTestProviders(args);
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_EQ(jsonLines(run.out), jsonValues(withAlphaAndGadget(GetParam().out)));
}

INSTANTIATE_TEST_SUITE_P(
    Commands, JsonOutputTest,
    testing::Values(
        OutputCase{"GetInstance", {"gi", kAlpha},
                   R"({"className":"Test_Widget","path":$ALPHA,"properties":{
                       "Name":{"type":"string","value":"alpha"},
                       "Caption":{"type":"string","value":"Widget alpha"},
                       "Size":{"type":"uint32","value":1},
                       "Tags":{"type":"string[]","value":["test","alpha"]},
                       "Created":{"type":"datetime","value":"20200101000001.000000+000"},
                       "Enabled":{"type":"boolean","value":true}}})"},
        OutputCase{"EnumerateNames", {"ein", "Test_SpecialWidget"}, kGammaPathJson},
        OutputCase{"Enumerate", {"--properties", "Size", "ei", "Test_SpecialWidget"},
                   std::string(R"({"className":"Test_SpecialWidget","path":)") + kGammaPathJson +
                       R"(,"properties":{"Size":{"type":"uint32","value":3}}})"},
        OutputCase{"AssociatorNames", {"ain", kAlpha}, "$GADGET"},
        OutputCase{"Associators", {"ai", kAlpha},
                   R"({"className":"Test_Gadget","path":$GADGET,"properties":{
                       "Id":{"type":"string","value":"gadget-alpha"},
                       "WidgetName":{"type":"string","value":"alpha"}}})"},
        OutputCase{"ReferenceNames", {"rin", kAlpha},
                   R"({"text":)" + Json(kLinkAlpha).dump() + R"(,"namespace":"root/cimv2",
                       "className":"Test_WidgetGadget","keys":{
                       "Owner":{"type":"reference","value":$ALPHA},
                       "Part":{"type":"reference","value":$GADGET}}})"},
        OutputCase{"References", {"--properties", "Part", "ri", kGadgetAlpha},
                   R"({"className":"Test_WidgetGadget","path":{"text":)" + Json(kLinkAlpha).dump() +
                       R"(,"namespace":"root/cimv2","className":"Test_WidgetGadget","keys":{
                       "Owner":{"type":"reference","value":$ALPHA},
                       "Part":{"type":"reference","value":$GADGET}}},
                       "properties":{"Part":{"type":"reference","value":$GADGET}}})"}),
    [](const auto &test) { return std::string(test.param.name); });

const Args kDemo = {"--seconds", "60", "demo"};

TEST(TvxcimDemoTest, MofShowsEverySectionAndFailuresInPlace) {
    const Outcome run = runOnTestProviders(kDemo);
    ASSERT_EQ(run.status, 0) << run.err;
    std::vector<std::string> headings;
    for (const std::string &line : lines(run.out)) {
        if (line.rfind("== ", 0) == 0) headings.push_back(line);
    }
    EXPECT_THAT(headings,
                ElementsAre("== ei Test_Widget", "== ei Test_SpecialWidget", "== ei Test_Gadget",
                            "== ei Test_WidgetGadget", "== ei Test_EventCounter", "== ei Test_ProviderStats",
                            "== ei Test_Missing", "== ei Test_NoFactory", "== ei Test_NullFactory",
                            "== ei Test_ThrowingFactory", "== ain " + std::string(kAlpha),
                            "== ain root/cimv2:Test_SpecialWidget.Name=\"gamma\"", "== ain " + std::string(kGadgetAlpha),
                            "== first indication of Test_Event"));
    EXPECT_THAT(run.out, HasSubstr("== ei Test_Missing\n   CMPI_RC_ERR_FAILED (1): provider MissingLib: "));
    EXPECT_THAT(run.out, HasSubstr("== first indication of Test_Event\n// root/cimv2:Test_Event\n"
                                   "instance of Test_Event\n{\n    Sequence = 0;\n"));
    // Shown in place in the output, and by the broker once each on stderr.
    EXPECT_EQ(lines(run.err).size(), 4U) << run.err;
}

TEST(TvxcimDemoTest, JsonWritesEachSectionAsOneObject) {
    Args args = {"--json"};
    args.insert(args.end(), kDemo.begin(), kDemo.end());
    const Outcome run = runOnTestProviders(args);
    ASSERT_EQ(run.status, 0) << run.err;
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

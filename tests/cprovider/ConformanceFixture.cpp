#include "ConformanceFixture.h"

#include <algorithm>
#include <utility>

#include "model/MofInstanceText.h"
#include "model/PathText.h"
#include "model/ValueText.h"

namespace tvxbroker {

void PrintTo(const CimValue &value, std::ostream *os) {
    *os << "type " << value.type;
    std::string text;
    bool quoted = false;
    if (value.null) {
        *os << " null";
    } else if (value.isArray()) {
        *os << " {";
        for (const CimValue &element : value.elements) {
            PrintTo(element, os);
            *os << "; ";
        }
        *os << "}";
    } else if (value.type == CMPI_instance && value.instance) {
        *os << " " << formatInstanceMof(*value.instance);
    } else if (scalarText(value, text, quoted)) {
        *os << " " << testing::PrintToString(text);
    }
}

}  // namespace tvxbroker

namespace conformance {

namespace {

const CimValue *find(const std::vector<NamedValue> &values, const std::string &name) {
    for (const NamedValue &value : values) {
        if (equalsIgnoreCase(value.name, name)) return &value.value;
    }
    return nullptr;
}

void expectSameValues(const std::vector<NamedValue> &actual, const std::vector<NamedValue> &expected,
                      const char *what) {
    EXPECT_EQ(actual.size(), expected.size()) << what << "s";
    for (const NamedValue &wanted : expected) {
        const CimValue *got = find(actual, wanted.name);
        if (got == nullptr) {
            ADD_FAILURE() << what << " " << wanted.name << " missing";
        } else {
            EXPECT_EQ(*got, wanted.value) << what << " " << wanted.name;
        }
    }
    for (const NamedValue &got : actual) {
        EXPECT_NE(find(expected, got.name), nullptr) << what << " " << got.name << " not expected";
    }
}

CimValue text(const char *value) { return CimValue::makeString(value); }

Instance expectedSample(const std::string &cls, const conf_sample &sample) {
    const CimValue nullText = CimValue::makeNull(CMPI_string);
    const CimValue nullCount = CimValue::makeNull(CMPI_uint32);
    const CimValue partId = text(sample.part_id);
    const Instance part{ObjectPath{"", kNs, "Conf_Part", {{"Id", partId}}},
                        {{"Id", partId}, {"Size", CimValue::makeUnsigned(CMPI_uint32, sample.part_size)}}};
    const std::vector<NamedValue> keys = {{"Name", text(sample.name)},
                                          {"Label", text(sample.label)},
                                          {"Slot", CimValue::makeUnsigned(CMPI_uint16, sample.slot)}};
    Instance instance{ObjectPath{"", kNs, cls, keys}, keys};
    instance.properties.insert(
        instance.properties.end(),
        {{"Text", text(sample.text)},
         {"Made", text(sample.made)},
         {"Missing", nullText},
         {"Enabled", CimValue::makeBoolean(sample.enabled != 0)},
         {"Count", CimValue::makeUnsigned(CMPI_uint64, sample.count)},
         {"Offset", CimValue::makeSigned(CMPI_sint64, sample.offset)},
         {"Ratio", CimValue::makeReal(CMPI_real64, sample.ratio)},
         {"Taken", CimValue::makeDateTime(DateTime{sample.taken, false})},
         {"Uptime", CimValue::makeDateTime(DateTime{sample.uptime, true})},
         {"Names", CimValue::makeArray(CMPI_string, {text(CONF_NAMES_0), nullText, text(CONF_NAMES_2)})},
         {"Counts", CimValue::makeArray(CMPI_uint32, {CimValue::makeUnsigned(CMPI_uint32, CONF_COUNTS_0),
                                                      nullCount, nullCount,
                                                      CimValue::makeUnsigned(CMPI_uint32, CONF_COUNTS_3)})},
         {"Nothing", CimValue::makeArray(CMPI_string, {})},
         {"Part", CimValue::makeInstance(part)}});
    return instance;
}

}  // namespace

std::vector<Instance> expectedSamples(const std::string &cls) {
    std::vector<Instance> samples;
    for (const conf_sample &sample : conf_samples) samples.push_back(expectedSample(cls, sample));
    return samples;
}

Instance expectedPeer(const Served &provider) {
    const std::vector<Instance> samples = expectedSamples(provider.sample);
    const std::vector<NamedValue> ends = {{"Antecedent", CimValue::makeReference(samples[0].path)},
                                          {"Dependent", CimValue::makeReference(samples[1].path)}};
    return Instance{ObjectPath{"", kNs, provider.peer, ends}, ends};
}

void expectSameInstances(std::vector<Instance> actual, std::vector<Instance> expected) {
    // Paired by the text of their paths, which shows no type, so that a value
    // of the wrong type is reported as such rather than as a missing item.
    const auto byPath = [](const Instance &a, const Instance &b) { return formatPath(a.path) < formatPath(b.path); };
    std::sort(actual.begin(), actual.end(), byPath);
    std::sort(expected.begin(), expected.end(), byPath);
    ASSERT_EQ(actual.size(), expected.size());
    for (std::size_t i = 0; i < actual.size(); ++i) {
        SCOPED_TRACE(formatPath(expected[i].path));
        const ObjectPath &path = actual[i].path;
        EXPECT_TRUE(equalsIgnoreCase(path.className, expected[i].path.className)) << path.className;
        EXPECT_EQ(path.nameSpace, expected[i].path.nameSpace);
        expectSameValues(path.keys, expected[i].path.keys, "key");
        expectSameValues(actual[i].properties, expected[i].properties, "property");
    }
}

void expectSamePaths(const std::vector<ObjectPath> &actual, std::vector<Instance> expected) {
    std::vector<Instance> named;
    for (const ObjectPath &path : actual) named.push_back(Instance{path, {}});
    for (Instance &instance : expected) instance.properties.clear();
    expectSameInstances(std::move(named), std::move(expected));
}

std::vector<Instance> ConformanceTest::enumerate(const std::string &cls) {
    Response response = broker.enumInstances(ObjectPath{"", kNs, cls, {}}, std::nullopt);
    EXPECT_TRUE(response.ok()) << cls << ": " << response.rc << " " << response.message.value_or("");
    return std::move(response.instances);
}

std::vector<ObjectPath> ConformanceTest::enumerateNames(const std::string &cls) {
    Response response = broker.enumInstanceNames(ObjectPath{"", kNs, cls, {}});
    EXPECT_TRUE(response.ok()) << cls << ": " << response.rc << " " << response.message.value_or("");
    return std::move(response.paths);
}

}  // namespace conformance

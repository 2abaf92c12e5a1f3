#include "ConformanceFixture.h"

#include <algorithm>
#include <utility>

#include "model/MofInstanceText.h"
#include "model/PathText.h"
#include "model/ValueText.h"

namespace tvxbroker {

void PrintTo(const CimValue &value, std::ostream *os) {
    *os << "type " << value.type;
    if (value.null) {
        *os << " null";
    } else if (value.isArray()) {
        *os << " {";
        for (const CimValue &element : value.elements) {
            PrintTo(element, os);
            *os << "; ";
        }
        *os << "}";
    } else if (value.type == CMPI_dateTime) {
        *os << " " << value.dateTime.microseconds << (value.dateTime.interval ? " interval" : " point");
    } else if (value.type == CMPI_instance && value.instance) {
        *os << " " << formatInstanceMof(*value.instance);
    } else {
        std::string text;
        bool quoted = false;
        if (scalarText(value, text, quoted)) *os << " " << testing::PrintToString(text);
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

std::vector<std::string> namesOf(const std::vector<NamedValue> &values) {
    std::vector<std::string> names;
    for (const NamedValue &value : values) names.push_back(value.name);
    return names;
}

void expectSameValues(const std::vector<NamedValue> &actual, const std::vector<NamedValue> &expected,
                      const std::string &what) {
    EXPECT_EQ(actual.size(), expected.size()) << what << "s " << testing::PrintToString(namesOf(actual));
    for (const NamedValue &wanted : expected) {
        SCOPED_TRACE(what + " " + wanted.name);
        const CimValue *got = find(actual, wanted.name);
        if (got == nullptr) {
            ADD_FAILURE() << "missing";
        } else {
            EXPECT_EQ(*got, wanted.value);
        }
    }
}

CimValue text(const char *value) { return CimValue::makeString(value); }

void expectSamePath(const ObjectPath &actual, const ObjectPath &expected) {
    EXPECT_TRUE(equalsIgnoreCase(actual.className, expected.className))
        << actual.className << " is not " << expected.className;
    EXPECT_EQ(actual.nameSpace, expected.nameSpace);
    expectSameValues(actual.keys, expected.keys, "key");
}

// Pairs items by the text of their paths, which shows no type, so that a
// value of the wrong type is reported as such rather than as a missing item.
template <class Item, class PathOf, class Compare>
void expectSameItems(std::vector<Item> actual, std::vector<Item> expected, PathOf pathOf,
                     Compare compare) {
    const auto byPath = [&](const Item &a, const Item &b) {
        return formatPath(pathOf(a)) < formatPath(pathOf(b));
    };
    std::sort(actual.begin(), actual.end(), byPath);
    std::sort(expected.begin(), expected.end(), byPath);
    ASSERT_EQ(actual.size(), expected.size());
    for (std::size_t i = 0; i < actual.size(); ++i) {
        SCOPED_TRACE(formatPath(pathOf(expected[i])));
        compare(actual[i], expected[i]);
    }
}

Instance expectedSample(const std::string &cls, const conf_sample &sample) {
    const CimValue nullText = CimValue::makeNull(CMPI_string);
    const CimValue nullCount = CimValue::makeNull(CMPI_uint32);
    const ObjectPath partPath{"", kNs, "Conf_Part", {{"Id", text(sample.part_id)}}};
    const Instance part{partPath,
                        {{"Id", text(sample.part_id)},
                         {"Size", CimValue::makeUnsigned(CMPI_uint32, sample.part_size)}}};
    const ObjectPath path = samplePath(cls, sample);
    return Instance{
        path,
        {{"Name", text(sample.name)},
         {"Label", text(sample.label)},
         {"Slot", CimValue::makeUnsigned(CMPI_uint16, sample.slot)},
         {"Text", text(sample.text)},
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
         {"Part", CimValue::makeInstance(part)}}};
}

}  // namespace

ObjectPath samplePath(const std::string &cls, const conf_sample &sample) {
    return ObjectPath{"", kNs, cls,
                      {{"Name", text(sample.name)},
                       {"Label", text(sample.label)},
                       {"Slot", CimValue::makeUnsigned(CMPI_uint16, sample.slot)}}};
}

std::vector<Instance> expectedSamples(const std::string &cls) {
    std::vector<Instance> samples;
    for (const conf_sample &sample : conf_samples) samples.push_back(expectedSample(cls, sample));
    return samples;
}

Instance expectedPeer(const Served &provider) {
    const CimValue antecedent = CimValue::makeReference(samplePath(provider.sample, conf_samples[0]));
    const CimValue dependent = CimValue::makeReference(samplePath(provider.sample, conf_samples[1]));
    return Instance{ObjectPath{"", kNs, provider.peer, {{"Antecedent", antecedent}, {"Dependent", dependent}}},
                    {{"Antecedent", antecedent}, {"Dependent", dependent}}};
}

void expectSamePaths(std::vector<ObjectPath> actual, std::vector<ObjectPath> expected) {
    expectSameItems(std::move(actual), std::move(expected), [](const ObjectPath &path) { return path; },
                    expectSamePath);
}

void expectSameInstances(std::vector<Instance> actual, std::vector<Instance> expected) {
    expectSameItems(std::move(actual), std::move(expected),
                    [](const Instance &instance) { return instance.path; },
                    [](const Instance &a, const Instance &b) {
                        expectSamePath(a.path, b.path);
                        expectSameValues(a.properties, b.properties, "property");
                    });
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

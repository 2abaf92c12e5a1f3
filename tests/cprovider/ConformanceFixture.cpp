#include "ConformanceFixture.h"

#include "model/ValueText.h"

namespace conformance {

namespace {

CimValue text(const char *value) { return CimValue::makeString(value); }

ObjectPath samplePath(const conf_sample &sample) {
    return ObjectPath{"", kNs, kSampleClass,
                      {{"Name", text(sample.name)},
                       {"Label", text(sample.label)},
                       {"Slot", CimValue::makeUnsigned(CMPI_uint16, sample.slot)}}};
}

Instance expectedSample(const conf_sample &sample) {
    const CimValue nullText = CimValue::makeNull(CMPI_string);
    const CimValue nullCount = CimValue::makeNull(CMPI_uint32);
    const CimValue partId = text(sample.part_id);
    const Instance part{ObjectPath{"", kNs, "Conf_Part", {{"Id", partId}}},
                        {{"Id", partId}, {"Size", CimValue::makeUnsigned(CMPI_uint32, sample.part_size)}}};
    Instance instance{samplePath(sample), samplePath(sample).keys};
    instance.properties.insert(
        instance.properties.end(),
        {{"Text", text(sample.text)},
         {"Made", text(sample.made)},
         {"Missing", nullText},
         {"Vacant", CimValue::makeNull(CMPI_uint16)},
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

std::string describeValue(const CimValue &value, const std::string &indent) {
    const std::string type = std::to_string(value.type);
    if (value.null) return type + " null";
    if (value.isArray()) {
        std::string elements;
        for (const CimValue &element : value.elements) elements += describeValue(element, indent) + "; ";
        return type + " [" + elements + "]";
    }
    if (value.type == CMPI_ref) return type + " " + describe(*value.reference, indent + "  ");
    if (value.type == CMPI_instance) return type + " " + describe(*value.instance, indent + "  ");
    std::string literal;
    bool quoted = false;
    scalarText(value, literal, quoted);
    std::string bytes;  // printable ASCII as is, every other byte in hex
    for (const unsigned char byte : literal) {
        static const char hex[] = "0123456789abcdef";
        bytes += byte >= 0x20 && byte < 0x7f ? std::string(1, static_cast<char>(byte))
                                             : std::string{'\\', 'x', hex[byte >> 4], hex[byte & 15]};
    }
    return type + " \"" + bytes + "\"";
}

std::string describeNamed(const std::vector<NamedValue> &values, const std::string &indent) {
    std::vector<std::string> lines;
    for (const NamedValue &named : values) {
        lines.push_back("\n" + indent + toLowerAscii(named.name) + ": " + describeValue(named.value, indent));
    }
    std::sort(lines.begin(), lines.end());
    std::string text;
    for (const std::string &line : lines) text += line;
    return text;
}

}  // namespace

std::vector<Instance> expectedObjects() {
    std::vector<Instance> objects;
    for (const conf_sample &sample : conf_samples) objects.push_back(expectedSample(sample));
    const std::vector<NamedValue> ends = {{"Antecedent", CimValue::makeReference(samplePath(conf_samples[0]))},
                                          {"Dependent", CimValue::makeReference(samplePath(conf_samples[1]))}};
    objects.push_back(Instance{ObjectPath{"", kNs, kPeerClass, ends}, ends});
    return objects;
}

std::string describe(const ObjectPath &path, const std::string &indent) {
    return toLowerAscii(path.className) + " in " + path.nameSpace + describeNamed(path.keys, indent + "  ");
}

std::string describe(const Instance &instance, const std::string &indent) {
    return describe(instance.path, indent) + "\n" + indent + "with" + describeNamed(instance.properties, indent + "  ");
}

}  // namespace conformance

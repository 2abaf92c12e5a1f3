// The binding held to the broker the plain-C provider pins down: it reads
// the C provider's objects through up-calls as the C provider set them, and
// the same objects built through it, as the product's providers build
// theirs, read back alike.
#include <string>
#include <utility>
#include <vector>

#include "CmpiArray.h"
#include "CmpiBroker.h"
#include "CmpiDateTime.h"
#include "CmpiStatus.h"
#include "ConformanceFixture.h"

namespace conformance {
namespace {

// What the binding reads of a value, in the broker's terms, so that it can be
// held against the same expectations as the broker.
std::string textOf(const CmpiString &text) { return text.isNull() ? "" : text.charPtr(); }

CimValue readValue(const CmpiData &data);

// Keys or properties, read by index as the binding offers them.
template <class ReadAt>
std::vector<NamedValue> readNamed(unsigned int count, ReadAt readAt) {
    std::vector<NamedValue> read;
    for (unsigned int i = 0; i < count; ++i) {
        CmpiString name;
        const CmpiData value = readAt(i, &name);
        read.push_back({textOf(name), readValue(value)});
    }
    return read;
}

ObjectPath readPath(const CmpiObjectPath &path) {
    return ObjectPath{textOf(path.getHostname()), textOf(path.getNameSpace()), textOf(path.getClassName()),
                      readNamed(path.getKeyCount(),
                                [&](unsigned int i, CmpiString *name) { return path.getKey(i, name); })};
}

Instance readInstance(const CmpiInstance &instance) {
    return Instance{readPath(instance.getObjectPath()),
                    readNamed(instance.getPropertyCount(),
                              [&](unsigned int i, CmpiString *name) { return instance.getProperty(i, name); })};
}

CimValue readValue(const CmpiData &data) {
    const CMPIType type = data.type();
    if (data.isNullValue()) return CimValue::makeNull(type);
    if ((type & CMPI_ARRAY) != 0) {
        const CmpiArray array = data;
        std::vector<CimValue> elements;
        for (unsigned int i = 0; i < array.size(); ++i) elements.push_back(readValue(array.getElementAt(i)));
        return CimValue::makeArray(array.getSimpleType(), std::move(elements));
    }
    switch (type) {
    case CMPI_string: {
        const char *text = data;
        return text != nullptr ? CimValue::makeString(text) : CimValue::makeNull(type);
    }
    case CMPI_boolean: return CimValue::makeBoolean(static_cast<bool>(data));
    case CMPI_uint16: return CimValue::makeUnsigned(type, static_cast<CMPIUint16>(data));
    case CMPI_uint32: return CimValue::makeUnsigned(type, static_cast<CMPIUint32>(data));
    case CMPI_uint64: return CimValue::makeUnsigned(type, static_cast<CMPIUint64>(data));
    case CMPI_sint64: return CimValue::makeSigned(type, static_cast<CMPISint64>(data));
    case CMPI_real64: return CimValue::makeReal(type, static_cast<CMPIReal64>(data));
    case CMPI_dateTime: {
        const CmpiDateTime dateTime = data;
        return CimValue::makeDateTime(DateTime{dateTime.getDateTime(), dateTime.isInterval()});
    }
    case CMPI_ref: return CimValue::makeReference(readPath(data));
    case CMPI_instance: return CimValue::makeInstance(readInstance(data));
    default:
        ADD_FAILURE() << "the binding read a value of CMPI type " << type;
        return CimValue::makeNull(type);
    }
}

// The conformance objects built through the binding, value for value as the
// C provider builds them through the function tables.
CmpiObjectPath samplePath(const conf_sample &sample) {
    CmpiObjectPath path(kNs, kSampleClass);
    path.setKey("Name", sample.name);
    path.setKey("Label", sample.label);
    path.setKey("Slot", sample.slot);
    return path;
}

CmpiInstance sampleInstance(const conf_sample &sample) {
    CmpiInstance inst(samplePath(sample));
    inst.setProperty("Name", sample.name);
    inst.setProperty("Label", sample.label);
    inst.setProperty("Slot", sample.slot);
    inst.setProperty("Text", sample.text);
    inst.setProperty("Made", sample.made);
    inst.setProperty("Missing", CmpiData(static_cast<const char *>(nullptr)));
    inst.setProperty("Vacant", CmpiData::nullOf(CMPI_uint16));
    inst.setProperty("Enabled", sample.enabled != 0);
    inst.setProperty("Count", sample.count);
    inst.setProperty("Offset", sample.offset);
    inst.setProperty("Ratio", sample.ratio);
    inst.setProperty("Taken", CmpiDateTime(sample.taken, false));
    inst.setProperty("Uptime", CmpiDateTime(sample.uptime, true));
    CmpiArray names(CONF_NAMES_SIZE, CMPI_string);
    names[0] = CONF_NAMES_0;
    names[2] = CONF_NAMES_2;
    inst.setProperty("Names", names);
    CmpiArray counts(CONF_COUNTS_SIZE, CMPI_uint32);
    counts[0] = CONF_COUNTS_0;
    counts[3] = CONF_COUNTS_3;
    inst.setProperty("Counts", counts);
    inst.setProperty("Nothing", CmpiArray(0, CMPI_string));
    CmpiObjectPath partPath(kNs, "Conf_Part");
    partPath.setKey("Id", sample.part_id);
    CmpiInstance part(partPath);
    part.setProperty("Id", sample.part_id);
    part.setProperty("Size", sample.part_size);
    inst.setProperty("Part", part);
    return inst;
}

CmpiInstance peerInstance() {
    const CmpiObjectPath antecedent = samplePath(conf_samples[0]);
    const CmpiObjectPath dependent = samplePath(conf_samples[1]);
    CmpiObjectPath path(kNs, kPeerClass);
    path.setKey("Antecedent", antecedent);
    path.setKey("Dependent", dependent);
    CmpiInstance inst(path);
    inst.setProperty("Antecedent", antecedent);
    inst.setProperty("Dependent", dependent);
    return inst;
}

TEST_F(ConformanceTest, TheBindingReadsAndWritesEveryValueAsACProviderDoes) {
    const CmpiBroker binding(broker.cmpiBroker());  // the binding makes its objects through it
    const CmpiContext ctx(broker.newContext(kNs));
    std::vector<Instance> read;
    std::vector<ObjectPath> names;
    std::vector<Instance> written;
    try {
        for (const char *cls : {kSampleClass, kPeerClass}) {
            const CmpiEnumeration found = binding.enumInstances(ctx, CmpiObjectPath(kNs, cls), nullptr);
            while (found.hasNext()) read.push_back(readInstance(found.getNext()));
        }
        const CmpiEnumeration found = binding.enumInstanceNames(ctx, CmpiObjectPath(kNs, kSampleClass));
        while (found.hasNext()) names.push_back(readPath(found.getNext()));
        for (const conf_sample &sample : conf_samples) written.push_back(readInstance(sampleInstance(sample)));
        written.push_back(readInstance(peerInstance()));
    } catch (const CmpiStatus &status) {
        FAIL() << "the binding threw status " << status.rc() << ": " << (status.msg() ? status.msg() : "");
    }
    const std::vector<Instance> expected = expectedObjects();
    const std::vector<ObjectPath> expectedNames = {expected[0].path, expected[1].path};
    EXPECT_EQ(describe(read), describe(expected));
    EXPECT_EQ(describe(names), describe(expectedNames));
    EXPECT_EQ(describe(written), describe(expected));
}

}  // namespace
}  // namespace conformance

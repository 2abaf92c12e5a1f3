// The binding held to the broker the plain-C provider pins down: what it
// reads of the C provider's objects through up-calls must be what the C
// provider set.
#include <string>
#include <utility>
#include <vector>

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

TEST_F(ConformanceTest, BindingReadsWhatTheCProviderSet) {
    const CmpiBroker binding(broker.cmpiBroker());
    const CmpiContext ctx(broker.newContext(kNs));
    const auto instancesOf = [&](const char *cls) {
        std::vector<Instance> read;
        const CmpiEnumeration found = binding.enumInstances(ctx, CmpiObjectPath(kNs, cls), nullptr);
        while (found.hasNext()) read.push_back(readInstance(found.getNext()));
        return read;
    };
    try {
        expectSameInstances(instancesOf(kCProvider.sample), expectedSamples(kCProvider.sample));
        expectSameInstances(instancesOf(kCProvider.peer), {expectedPeer(kCProvider)});

        std::vector<ObjectPath> names;
        const CmpiEnumeration found = binding.enumInstanceNames(ctx, CmpiObjectPath(kNs, kCProvider.sample));
        while (found.hasNext()) names.push_back(readPath(found.getNext()));
        expectSamePaths(names, expectedSamples(kCProvider.sample));
    } catch (const CmpiStatus &status) {
        FAIL() << "the binding threw status " << status.rc() << ": " << (status.msg() ? status.msg() : "");
    }
}

}  // namespace
}  // namespace conformance

#include "CmpiData.h"

#include <string>

#include "CmpiArray.h"
#include "CmpiDateTime.h"
#include "CmpiInstance.h"
#include "CmpiStatus.h"

namespace {

CMPIData makeData(CMPIType type) {
    CMPIData data{};
    data.type = type;
    data.state = CMPI_goodValue;
    return data;
}

// Objects: a null handle is a null value of the type.
template <class Handle>
CMPIData objectData(CMPIType type, Handle *handle, Handle *CMPIValue::*member) {
    CMPIData data = makeData(type);
    data.value.*member = handle;
    if (handle == nullptr) data.state = CMPI_nullValue;
    return data;
}

}  // namespace

CmpiData::CmpiData() : data(makeData(CMPI_null)) { data.state = CMPI_nullValue; }

CmpiData::CmpiData(const CMPIData &value) : data(value) {
    if (data.type == CMPI_chars && data.value.chars != nullptr) chars = data.value.chars;
}

CmpiData::CmpiData(bool value) : data(makeData(CMPI_boolean)) { data.value.boolean = value ? 1 : 0; }
CmpiData::CmpiData(CMPIUint8 value) : data(makeData(CMPI_uint8)) { data.value.uint8 = value; }
CmpiData::CmpiData(CMPIUint16 value) : data(makeData(CMPI_uint16)) { data.value.uint16 = value; }
CmpiData::CmpiData(CMPIUint32 value) : data(makeData(CMPI_uint32)) { data.value.uint32 = value; }
CmpiData::CmpiData(CMPIUint64 value) : data(makeData(CMPI_uint64)) { data.value.uint64 = value; }
CmpiData::CmpiData(CMPISint8 value) : data(makeData(CMPI_sint8)) { data.value.sint8 = value; }
CmpiData::CmpiData(CMPISint16 value) : data(makeData(CMPI_sint16)) { data.value.sint16 = value; }
CmpiData::CmpiData(CMPISint32 value) : data(makeData(CMPI_sint32)) { data.value.sint32 = value; }
CmpiData::CmpiData(CMPISint64 value) : data(makeData(CMPI_sint64)) { data.value.sint64 = value; }
CmpiData::CmpiData(CMPIReal32 value) : data(makeData(CMPI_real32)) { data.value.real32 = value; }
CmpiData::CmpiData(CMPIReal64 value) : data(makeData(CMPI_real64)) { data.value.real64 = value; }

CmpiData::CmpiData(const char *value) : data(makeData(CMPI_chars)) {
    if (value == nullptr) {
        data.state = CMPI_nullValue;
    } else {
        chars = value;
    }
}

CmpiData::CmpiData(const std::string &value) : CmpiData(value.c_str()) {}

CmpiData::CmpiData(const CmpiString &value) : CmpiData(value.charPtr()) {}

CmpiData::CmpiData(const CmpiObjectPath &value)
    : data(objectData(CMPI_ref, value.getEnc(), &CMPIValue::ref)) {}

CmpiData::CmpiData(const CmpiInstance &value)
    : data(objectData(CMPI_instance, value.getEnc(), &CMPIValue::inst)) {}

CmpiData::CmpiData(const CmpiArray &value)
    : data(objectData(value.isNull() ? CMPIType(CMPI_ARRAY) : CMPIType(value.getSimpleType() | CMPI_ARRAY),
                      value.getEnc(), &CMPIValue::array)) {}

CmpiData::CmpiData(const CmpiDateTime &value)
    : data(objectData(CMPI_dateTime, value.getEnc(), &CMPIValue::dateTime)) {}

CmpiData CmpiData::nullOf(CMPIType type) {
    CmpiData null;
    null.data.type = type;
    return null;
}

// Brokers read a null pointer as a null value of the type, and a CMPI_chars
// value as the C string itself, not as a CMPIValue holding it: the
// conventions of every C provider.
const CMPIValue *CmpiData::value() const {
    if (isNullValue()) return nullptr;
    if (data.type == CMPI_chars) return reinterpret_cast<const CMPIValue *>(chars.c_str());
    return &data.value;
}

void CmpiData::requireType(CMPIType wanted) const {
    if (isNotFound()) throw CmpiStatus(CMPI_RC_ERR_NO_SUCH_PROPERTY, "no such property or key");
    if (data.type != wanted) {
        const std::string text = "value of CMPI type " + std::to_string(data.type) +
                                 " read as CMPI type " + std::to_string(wanted);
        throw CmpiStatus(CMPI_RC_ERR_TYPE_MISMATCH, text.c_str());
    }
}

namespace {
void requireValue(const CmpiData &value) {
    if (value.isNullValue()) throw CmpiStatus(CMPI_RC_ERR_NO_SUCH_PROPERTY, "value is null");
}
}  // namespace

CmpiData::operator CmpiString() const {
    if (data.type == CMPI_chars) {
        requireType(CMPI_chars);
        return isNullValue() ? CmpiString() : CmpiString(chars);
    }
    requireType(CMPI_string);
    return isNullValue() ? CmpiString() : CmpiString(data.value.string);
}

CmpiData::operator const char *() const {
    if (data.type == CMPI_chars) {
        requireType(CMPI_chars);
        return isNullValue() ? nullptr : chars.c_str();
    }
    requireType(CMPI_string);
    if (isNullValue() || data.value.string == nullptr || data.value.string->ft == nullptr) {
        return nullptr;
    }
    return data.value.string->ft->getCharPtr(data.value.string, nullptr);
}

#define CMPI_DATA_SCALAR(cType, typeCode, member) \
    CmpiData::operator cType() const {            \
        requireType(typeCode);                    \
        requireValue(*this);                      \
        return data.value.member;                 \
    }

CMPI_DATA_SCALAR(CMPIUint8, CMPI_uint8, uint8)
CMPI_DATA_SCALAR(CMPIUint16, CMPI_uint16, uint16)
CMPI_DATA_SCALAR(CMPIUint32, CMPI_uint32, uint32)
CMPI_DATA_SCALAR(CMPIUint64, CMPI_uint64, uint64)
CMPI_DATA_SCALAR(CMPISint8, CMPI_sint8, sint8)
CMPI_DATA_SCALAR(CMPISint16, CMPI_sint16, sint16)
CMPI_DATA_SCALAR(CMPISint32, CMPI_sint32, sint32)
CMPI_DATA_SCALAR(CMPISint64, CMPI_sint64, sint64)
CMPI_DATA_SCALAR(CMPIReal32, CMPI_real32, real32)
CMPI_DATA_SCALAR(CMPIReal64, CMPI_real64, real64)

CmpiData::operator bool() const {
    requireType(CMPI_boolean);
    requireValue(*this);
    return data.value.boolean != 0;
}

CmpiData::operator CmpiObjectPath() const {
    requireType(CMPI_ref);
    requireValue(*this);
    return CmpiObjectPath(data.value.ref);
}

CmpiData::operator CmpiInstance() const {
    requireType(CMPI_instance);
    requireValue(*this);
    return CmpiInstance(data.value.inst);
}

CmpiData::operator CmpiDateTime() const {
    requireType(CMPI_dateTime);
    requireValue(*this);
    return CmpiDateTime(data.value.dateTime);
}

CmpiData::operator CmpiArray() const {
    if (isNotFound()) throw CmpiStatus(CMPI_RC_ERR_NO_SUCH_PROPERTY, "no such property or key");
    if ((data.type & CMPI_ARRAY) == 0) {
        throw CmpiStatus(CMPI_RC_ERR_TYPE_MISMATCH, "value is not an array");
    }
    requireValue(*this);
    return CmpiArray(data.value.array);
}

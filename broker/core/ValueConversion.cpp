#include "core/EncSupport.h"

namespace tvxbroker::enc {

namespace {

CimValue scalarToModel(const CMPIValue &v, CMPIType type, CMPIrc *rc) {
    CimValue out = CimValue::makeNull(type);
    out.null = false;
    switch (type) {
    case CMPI_boolean: out.boolean = v.boolean != 0; break;
    case CMPI_char16: out.unsignedValue = v.char16; break;
    case CMPI_uint8: out.unsignedValue = v.uint8; break;
    case CMPI_uint16: out.unsignedValue = v.uint16; break;
    case CMPI_uint32: out.unsignedValue = v.uint32; break;
    case CMPI_uint64: out.unsignedValue = v.uint64; break;
    case CMPI_sint8: out.signedValue = v.sint8; break;
    case CMPI_sint16: out.signedValue = v.sint16; break;
    case CMPI_sint32: out.signedValue = v.sint32; break;
    case CMPI_sint64: out.signedValue = v.sint64; break;
    case CMPI_real32: out.real = v.real32; break;
    case CMPI_real64: out.real = v.real64; break;
    case CMPI_string: {
        EncString *s = stringOf(v.string);
        if (s == nullptr && v.string != nullptr) *rc = CMPI_RC_ERR_INVALID_HANDLE;
        out.null = s == nullptr;
        if (s != nullptr) out.text = s->text;
        break;
    }
    case CMPI_dateTime: {
        EncDateTime *d = dateTimeOf(v.dateTime);
        if (d == nullptr && v.dateTime != nullptr) *rc = CMPI_RC_ERR_INVALID_HANDLE;
        out.null = d == nullptr;
        if (d != nullptr) out.dateTime = d->value;
        break;
    }
    case CMPI_ref: {
        EncObjectPath *p = pathOf(v.ref);
        if (p == nullptr && v.ref != nullptr) *rc = CMPI_RC_ERR_INVALID_HANDLE;
        out.null = p == nullptr;
        if (p != nullptr) out.reference = std::make_shared<ObjectPath>(p->value);
        break;
    }
    case CMPI_instance: {
        EncInstance *i = instanceOf(v.inst);
        if (i == nullptr && v.inst != nullptr) *rc = CMPI_RC_ERR_INVALID_HANDLE;
        out.null = i == nullptr;
        if (i != nullptr) out.instance = std::make_shared<Instance>(i->value);
        break;
    }
    default: *rc = CMPI_RC_ERR_INVALID_DATA_TYPE;
    }
    return out;
}

}  // namespace

CimValue toModel(const CMPIValue *value, CMPIType type, CMPIrc *rc) {
    *rc = CMPI_RC_OK;
    // As sfcb and OpenPegasus read it: for CMPI_chars the argument is the C
    // string itself, and the value is kept as a string.
    if (type == CMPI_chars) {
        if (value == nullptr) return CimValue::makeNull(CMPI_string);
        return CimValue::makeString(reinterpret_cast<const char *>(value));
    }
    if (value == nullptr) return CimValue::makeNull(type);
    if ((type & CMPI_ARRAY) != 0) {
        EncArray *array = arrayOf(value->array);
        if (array == nullptr) {
            if (value->array != nullptr) *rc = CMPI_RC_ERR_INVALID_HANDLE;
            return CimValue::makeNull(type);
        }
        return array->value;
    }
    return scalarToModel(*value, type, rc);
}

CMPIData toCmpi(const CimValue &value) {
    CMPIData data{};
    data.type = value.type;
    data.state = value.null ? CMPIValueState(CMPI_nullValue) : CMPIValueState(CMPI_goodValue);
    if (value.null) return data;
    CMPIValue &v = data.value;
    if (value.isArray()) {
        v.array = newArray(value);
        return data;
    }
    switch (value.type) {
    case CMPI_boolean: v.boolean = value.boolean ? 1 : 0; break;
    case CMPI_char16: v.char16 = static_cast<CMPIChar16>(value.unsignedValue); break;
    case CMPI_uint8: v.uint8 = static_cast<CMPIUint8>(value.unsignedValue); break;
    case CMPI_uint16: v.uint16 = static_cast<CMPIUint16>(value.unsignedValue); break;
    case CMPI_uint32: v.uint32 = static_cast<CMPIUint32>(value.unsignedValue); break;
    case CMPI_uint64: v.uint64 = value.unsignedValue; break;
    case CMPI_sint8: v.sint8 = static_cast<CMPISint8>(value.signedValue); break;
    case CMPI_sint16: v.sint16 = static_cast<CMPISint16>(value.signedValue); break;
    case CMPI_sint32: v.sint32 = static_cast<CMPISint32>(value.signedValue); break;
    case CMPI_sint64: v.sint64 = value.signedValue; break;
    case CMPI_real32: v.real32 = static_cast<CMPIReal32>(value.real); break;
    case CMPI_real64: v.real64 = value.real; break;
    case CMPI_string: v.string = newString(value.text); break;
    case CMPI_dateTime: v.dateTime = newDateTime(value.dateTime); break;
    case CMPI_ref: v.ref = newObjectPath(*value.reference); break;
    case CMPI_instance: v.inst = newInstance(*value.instance); break;
    default: data.state = CMPI_badValue;
    }
    return data;
}

}  // namespace tvxbroker::enc

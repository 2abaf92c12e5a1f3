// One CMPI value with its type and state. It is built from C++ values to set
// properties and keys, and converts back to them when read; a conversion to
// the wrong type, or of a missing or null value, throws a CmpiStatus.
#pragma once

#include <string>

#include "CmpiString.h"
#include "cmpi/cmpift.h"

class CmpiObjectPath;
class CmpiInstance;
class CmpiArray;
class CmpiDateTime;

class CmpiData {
public:
    CmpiData();  // a null value
    explicit CmpiData(const CMPIData &data);
    CmpiData(bool value);  // NOLINT(google-explicit-constructor)
    CmpiData(CMPIUint8 value);  // NOLINT
    CmpiData(CMPIUint16 value);  // NOLINT
    CmpiData(CMPIUint32 value);  // NOLINT
    CmpiData(CMPIUint64 value);  // NOLINT
    CmpiData(CMPISint8 value);  // NOLINT
    CmpiData(CMPISint16 value);  // NOLINT
    CmpiData(CMPISint32 value);  // NOLINT
    CmpiData(CMPISint64 value);  // NOLINT
    CmpiData(CMPIReal32 value);  // NOLINT
    CmpiData(CMPIReal64 value);  // NOLINT
    CmpiData(const char *value);  // NOLINT: null gives a null string
    CmpiData(const std::string &value);  // NOLINT
    CmpiData(const CmpiString &value);  // NOLINT
    CmpiData(const CmpiObjectPath &value);  // NOLINT
    CmpiData(const CmpiInstance &value);  // NOLINT
    CmpiData(const CmpiArray &value);  // NOLINT
    CmpiData(const CmpiDateTime &value);  // NOLINT
    // A null value of the type, as a property or key whose type is known
    // but whose value is not.
    static CmpiData nullOf(CMPIType type);

    CMPIType type() const { return data.type; }
    bool isNullValue() const { return (data.state & CMPI_nullValue) != 0; }
    bool isNotFound() const { return (data.state & CMPI_notFound) != 0; }

    operator CmpiString() const;  // NOLINT
    operator const char *() const;  // NOLINT: null for a null string
    operator bool() const;  // NOLINT
    operator CMPIUint8() const;  // NOLINT
    operator CMPIUint16() const;  // NOLINT
    operator CMPIUint32() const;  // NOLINT
    operator CMPIUint64() const;  // NOLINT
    operator CMPISint8() const;  // NOLINT
    operator CMPISint16() const;  // NOLINT
    operator CMPISint32() const;  // NOLINT
    operator CMPISint64() const;  // NOLINT
    operator CMPIReal32() const;  // NOLINT
    operator CMPIReal64() const;  // NOLINT
    operator CmpiObjectPath() const;  // NOLINT
    operator CmpiInstance() const;  // NOLINT
    operator CmpiArray() const;  // NOLINT
    operator CmpiDateTime() const;  // NOLINT

    // The value argument to hand to a broker with type(): null for a null
    // value, for CMPI_chars the C string itself, else a CMPIValue; valid
    // while this object lives.
    const CMPIValue *value() const;
    const CMPIData &getEnc() const { return data; }

private:
    void requireType(CMPIType wanted) const;

    CMPIData data;
    std::string chars;  // the text of a chars value, owned here
};

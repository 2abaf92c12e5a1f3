// A CIM array of one element type; elements never set stay null.
#pragma once

#include "CmpiData.h"

class CmpiArray;

// What arr[i] yields: assignable from a value and readable as one.
class CmpiArrayIdx {
public:
    CmpiArrayIdx(const CmpiArray &owner, unsigned int position) : array(owner), index(position) {}
    CmpiArrayIdx &operator=(const CmpiData &value);
    operator CmpiData() const;  // NOLINT

private:
    const CmpiArray &array;
    unsigned int index;
};

class CmpiArray {
public:
    CmpiArray() = default;
    // A new array of `size` null elements of `elementType` from the broker.
    CmpiArray(unsigned int size, CMPIType elementType);
    explicit CmpiArray(const CMPIArray *handle) : arr(const_cast<CMPIArray *>(handle)) {}

    unsigned int size() const;
    CMPIType getSimpleType() const;
    CmpiData getElementAt(unsigned int index) const;
    void setElementAt(unsigned int index, const CmpiData &value) const;
    CmpiArrayIdx operator[](unsigned int index) const { return CmpiArrayIdx(*this, index); }

    bool isNull() const { return arr == nullptr; }
    CMPIArray *getEnc() const { return arr; }

private:
    CMPIArray *handle() const;

    CMPIArray *arr = nullptr;
};

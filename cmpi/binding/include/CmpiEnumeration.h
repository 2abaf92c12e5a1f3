// The answer of a broker up-call: instances or object paths, read in order.
#pragma once

#include "CmpiArray.h"

class CmpiEnumeration {
public:
    CmpiEnumeration() = default;
    explicit CmpiEnumeration(const CMPIEnumeration *handle)
        : en(const_cast<CMPIEnumeration *>(handle)) {}

    bool hasNext() const;
    CmpiData getNext() const;
    CmpiArray toArray() const;

    CMPIEnumeration *getEnc() const { return en; }

private:
    CMPIEnumeration *handle() const;

    CMPIEnumeration *en = nullptr;
};

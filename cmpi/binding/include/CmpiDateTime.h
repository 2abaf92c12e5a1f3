// A CIM datetime: a point in time or an interval, in microseconds.
#pragma once

#include "CmpiData.h"

class CmpiDateTime {
public:
    CmpiDateTime();  // now, from the broker
    CmpiDateTime(CMPIUint64 microseconds, bool interval);
    explicit CmpiDateTime(const char *cimText);
    explicit CmpiDateTime(const CMPIDateTime *handle) : dt(const_cast<CMPIDateTime *>(handle)) {}

    CMPIUint64 getDateTime() const;  // microseconds
    bool isInterval() const;
    CmpiString toString() const;  // the CIM datetime text

    CMPIDateTime *getEnc() const { return dt; }

private:
    CMPIDateTime *handle() const;

    CMPIDateTime *dt = nullptr;
};

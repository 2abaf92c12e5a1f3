// A CIM instance: its object path and its properties.
#pragma once

#include "CmpiObjectPath.h"

class CmpiInstance {
public:
    CmpiInstance() = default;
    // A new instance of the path's class from the broker.
    explicit CmpiInstance(const CmpiObjectPath &path);
    explicit CmpiInstance(const CMPIInstance *handle) : inst(const_cast<CMPIInstance *>(handle)) {}

    CmpiData getProperty(const char *name) const;  // notFound state when absent
    CmpiData getProperty(unsigned int index, CmpiString *name) const;
    unsigned int getPropertyCount() const;
    void setProperty(const char *name, const CmpiData &value);

    CmpiObjectPath getObjectPath() const;
    void setObjectPath(const CmpiObjectPath &path);
    // Properties outside a non-null list are dropped by the broker when set.
    void setPropertyFilter(const char **properties, const char **keys);

    // A copy that belongs to the caller: no release of a thread's objects
    // frees it, so it can outlive the cycle that made it. It lives until
    // release().
    CmpiInstance clone() const;
    // Frees a copy made by clone(); the instance is null afterwards.
    void release();

    bool isNull() const { return inst == nullptr; }
    CMPIInstance *getEnc() const { return inst; }

private:
    CMPIInstance *handle() const;

    CMPIInstance *inst = nullptr;
};

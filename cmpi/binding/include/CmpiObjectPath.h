// A CIM object path: namespace, class name and keys.
#pragma once

#include "CmpiData.h"

class CmpiObjectPath {
public:
    CmpiObjectPath() = default;
    // A new path from the broker; namespace and class may be null.
    CmpiObjectPath(const char *ns, const char *className);
    CmpiObjectPath(const CmpiString &ns, const char *className);
    explicit CmpiObjectPath(const CMPIObjectPath *handle)
        : op(const_cast<CMPIObjectPath *>(handle)) {}

    CmpiString getNameSpace() const;
    void setNameSpace(const char *ns);
    CmpiString getHostname() const;
    void setHostname(const char *host);
    CmpiString getClassName() const;
    void setClassName(const char *className);

    CmpiData getKey(const char *name) const;  // notFound state when absent
    CmpiData getKey(unsigned int index, CmpiString *name) const;
    unsigned int getKeyCount() const;
    void setKey(const char *name, const CmpiData &value);

    // True when this path's class is the named class or derives from it,
    // by the broker's class hierarchy.
    bool classPathIsA(const char *className) const;

    CmpiString toString() const;
    bool isNull() const { return op == nullptr; }
    CMPIObjectPath *getEnc() const { return op; }

private:
    CMPIObjectPath *handle() const;

    CMPIObjectPath *op = nullptr;
};

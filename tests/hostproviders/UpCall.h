// A provider's getInstance up-call to the stand-in host providers, as the
// product makes it: answered OK without an instance, it would kill sfcb's
// provider process, so every path they do not serve must be NOT_FOUND here
// too.
#pragma once

#include "CmpiBroker.h"
#include "CmpiObjectPath.h"
#include "CmpiStatus.h"
#include "ProductBroker.h"
#include "core/ObjectPool.h"

namespace producttest {

inline CmpiData keyData(const CimValue &value) {
    switch (value.type) {
    case CMPI_string: return CmpiData(value.text);
    case CMPI_boolean: return CmpiData(value.boolean);
    case CMPI_uint64: return CmpiData(CMPIUint64(value.unsignedValue));
    case CMPI_sint64: return CmpiData(CMPISint64(value.signedValue));
    default:
        ADD_FAILURE() << "no up-call key of CMPI type " << value.type;
        return CmpiData();
    }
}

// The status the up-call for `path` ends in.
inline CMPIrc upCallStatus(Broker &broker, const ObjectPath &path) {
    const RequestScope request;
    const CmpiBroker up(broker.cmpiBroker());
    CmpiObjectPath cop(path.nameSpace.c_str(), path.className.c_str());
    for (const NamedValue &key : path.keys) cop.setKey(key.name.c_str(), keyData(key.value));
    try {
        up.getInstance(CmpiContext(broker.newContext(path.nameSpace)), cop, nullptr);
    } catch (const CmpiStatus &status) {
        return status.rc();
    }
    return CMPI_RC_OK;
}

}  // namespace producttest

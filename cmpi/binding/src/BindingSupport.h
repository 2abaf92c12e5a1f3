// Pieces shared by the binding's sources; not part of its interface.
#pragma once

#include <exception>

#include "CmpiBaseMI.h"
#include "CmpiStatus.h"

namespace cmpibinding {

// The broker the value types ask for new objects: the one the providers of
// this library were created with.
const CMPIBroker *currentBroker();
void rememberBroker(const CMPIBroker *broker);

template <class Handle>
Handle *requireHandle(Handle *handle, const char *what) {
    if (handle == nullptr || handle->ft == nullptr) {
        throw CmpiStatus(CMPI_RC_ERR_INVALID_HANDLE, what);
    }
    return handle;
}

const CMPIBroker *requireBroker();

inline CMPIStatus okStatus() { return CMPIStatus{CMPI_RC_OK, nullptr}; }

// Runs one provider operation for the broker: whatever it returns or throws
// becomes a CMPI status, so no exception ever reaches the C caller.
template <class Operation>
CMPIStatus runOperation(const CmpiBaseMI *provider, Operation &&operation) noexcept {
    const CMPIBroker *broker = provider->getBroker()->getEnc();
    try {
        return operation().toCMPIStatus(broker);
    } catch (const CmpiStatus &status) {
        return status.toCMPIStatus(broker);
    } catch (const std::exception &error) {
        return CmpiStatus(CMPI_RC_ERR_FAILED, error.what()).toCMPIStatus(broker);
    } catch (...) {
        return CmpiStatus(CMPI_RC_ERR_FAILED, "provider operation failed with an unknown exception")
            .toCMPIStatus(broker);
    }
}

// The provider object behind an interface handle, or null.
inline CmpiBaseMI *providerOf(const void *mi) {
    if (mi == nullptr) return nullptr;
    // Every management-interface object starts with its handle.
    return static_cast<CmpiBaseMI *>(*static_cast<void *const *>(mi));
}

CMPIStatus invalidHandle();

}  // namespace cmpibinding

#include "CmpiData.h"

namespace cmpibinding {

// A looked-up property, key or entry: absence is a value state, not an error.
CmpiData lookedUp(CMPIData data, const CMPIStatus &rc);

// Calls a broker function that reports through a trailing CMPIStatus* and
// throws what it reports.
template <class Function, class... Args>
auto callChecked(Function function, Args... args) {
    CMPIStatus rc = okStatus();
    auto result = function(args..., &rc);
    cmpiCheck(rc);
    return result;
}

}  // namespace cmpibinding

// The memory table of the broker, offered where it stands in for stock sfcb:
// marks over the object pools, the C heap, and explicit frees.
#include <cstdlib>
#include <cstring>

#include "core/BrokerState.h"
#include "core/EncSupport.h"
#include "core/PoolMark.h"

namespace tvxbroker {

namespace {

CMPIGcStat *mark(const CMPIBroker *, CMPIStatus *rc) {
    enc::setRc(rc, CMPI_RC_OK);
    return PoolMark::placeInCurrentPool();
}

CMPIStatus releaseMark(const CMPIBroker *, const CMPIGcStat *gc) {
    if (!PoolMark::release(gc)) return enc::status(CMPI_RC_ERR_INVALID_HANDLE, "not a live mark of this broker");
    return enc::status(CMPI_RC_OK);
}

void *cmpiMalloc(const CMPIBroker *, size_t size) { return std::malloc(size); }
void *cmpiCalloc(const CMPIBroker *, size_t count, size_t size) { return std::calloc(count, size); }
void *cmpiRealloc(const CMPIBroker *, void *ptr, size_t size) { return std::realloc(ptr, size); }
char *cmpiStrDup(const CMPIBroker *, const char *str) {
    return str != nullptr ? strdup(str) : nullptr;
}
void cmpiFree(const CMPIBroker *, void *ptr) { std::free(ptr); }

template <class Object, class Handle>
void freeWith(Object *(*lookupFunction)(const Handle *), Handle *handle) {
    if (Object *object = lookupFunction(handle)) enc::releaseObject(object);
}

void freeInstance(const CMPIBroker *, CMPIInstance *inst) { freeWith(enc::instanceOf, inst); }
void freeObjectPath(const CMPIBroker *, CMPIObjectPath *op) { freeWith(enc::pathOf, op); }
void freeArgs(const CMPIBroker *, CMPIArgs *) {}
void freeString(const CMPIBroker *, CMPIString *s) { freeWith(enc::stringOf, s); }
void freeArray(const CMPIBroker *, CMPIArray *a) { freeWith(enc::arrayOf, a); }
void freeDateTime(const CMPIBroker *, CMPIDateTime *d) { freeWith(enc::dateTimeOf, d); }
void freeSelectExp(const CMPIBroker *, CMPISelectExp *s) { freeWith(enc::selectExpOf, s); }

}  // namespace

const CMPIBrokerMemFT brokerMemFT = {
    CMPICurrentVersion, mark,         releaseMark,    cmpiMalloc,    cmpiCalloc,
    cmpiRealloc,        cmpiStrDup,   cmpiFree,       freeInstance,  freeObjectPath,
    freeArgs,           freeString,   freeArray,      freeDateTime,  freeSelectExp};

}  // namespace tvxbroker

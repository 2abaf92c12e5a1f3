// Construction, lookup and cloning shared by the encapsulated types.
#pragma once

#include "core/EncObjects.h"

namespace tvxbroker::enc {

extern const CMPIStringFT stringFT;
extern const CMPIArrayFT arrayFT;
extern const CMPIDateTimeFT dateTimeFT;
extern const CMPIObjectPathFT objectPathFT;
extern const CMPIInstanceFT instanceFT;
extern const CMPIEnumerationFT enumerationFT;
extern const CMPISelectExpFT selectExpFT;
extern const CMPIContextExtFT contextFT;        // the host's broker: eight entries
extern const CMPIContextFT publishedContextFT;  // stock sfcb: seven
extern const CMPIResultFT resultFT;

template <class Object, class Table>
std::unique_ptr<Object> makeUnpooled(const Table *table) {
    auto object = std::make_unique<Object>();
    object->cmpi.hdl = object.get();
    object->cmpi.ft = table;
    return object;
}

template <class Object, class Table>
Object *makePooled(const Table *table) {
    auto object = makeUnpooled<Object>(table);
    Object *raw = object.get();
    ObjectPool::current().adopt(std::move(object));
    return raw;
}

template <class Object, class Handle, class Table>
Object *lookup(const Handle *handle, const Table *table) {
    if (handle == nullptr || handle->ft != table || handle->hdl == nullptr) return nullptr;
    return static_cast<Object *>(handle->hdl);
}

// The object behind a handle, with rc saying whether there was one.
template <class Object>
Object *reportLookup(Object *object, CMPIStatus *rc) {
    setRc(rc, object == nullptr ? CMPI_RC_ERR_INVALID_HANDLE : CMPI_RC_OK);
    return object;
}

// A copy the caller owns and frees with release.
template <class Object>
decltype(Object::cmpi) *cloneOf(const Object *original, CMPIStatus *rc) {
    if (original == nullptr) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    auto copy = std::make_unique<Object>(*original);
    copy->pool = nullptr;
    copy->cmpi.hdl = copy.get();
    setRc(rc, CMPI_RC_OK);
    return &copy.release()->cmpi;
}

template <class Object>
CMPIStatus releaseOf(Object *object) {
    if (object == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    return releaseObject(object);
}

}  // namespace tvxbroker::enc

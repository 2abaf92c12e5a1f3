#include "core/EncSupport.h"

namespace tvxbroker::enc {

CMPIStatus status(CMPIrc rc) { return CMPIStatus{rc, nullptr}; }

CMPIStatus status(CMPIrc rc, const std::string &message) {
    return CMPIStatus{rc, newString(message)};
}

void setRc(CMPIStatus *rc, CMPIrc code) {
    if (rc != nullptr) *rc = status(code);
}

void setRc(CMPIStatus *rc, CMPIrc code, const std::string &message) {
    if (rc != nullptr) *rc = status(code, message);
}

CMPIData notFoundData() {
    CMPIData data{};
    data.type = CMPI_null;
    data.state = CMPI_notFound;
    return data;
}

CMPIStatus releaseObject(PooledObject *object) {
    if (object->pool != nullptr) {
        object->pool->release(object);
    } else {
        delete object;
    }
    return status(CMPI_RC_OK);
}

std::string typeNameOf(const void *handle) {
    if (handle == nullptr) return "";
    // Every encapsulated handle is {hdl, ft}: the table tells the type.
    const void *table = static_cast<const void *const *>(handle)[1];
    const struct {
        const void *table;
        const char *name;
    } known[] = {{&stringFT, "CMPIString"},       {&arrayFT, "CMPIArray"},
                 {&dateTimeFT, "CMPIDateTime"},   {&objectPathFT, "CMPIObjectPath"},
                 {&instanceFT, "CMPIInstance"},   {&enumerationFT, "CMPIEnumeration"},
                 {&selectExpFT, "CMPISelectExp"}, {&contextFT, "CMPIContext"},
                 {&publishedContextFT, "CMPIContext"}, {&resultFT, "CMPIResult"}};
    for (const auto &entry : known) {
        if (entry.table == table) return entry.name;
    }
    return "";
}

}  // namespace tvxbroker::enc

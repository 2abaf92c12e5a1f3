// Invocation contexts, with the host broker's eighth context entry or, as
// stock sfcb has them, with the seven published entries alone; and the
// result objects of requests.
#include "core/EncSupport.h"

namespace tvxbroker::enc {

namespace {

CMPIStatus contextRelease(CMPIContext *ctx) {
    EncContext *context = contextOf(ctx);
    // A thread context belongs to the broker until shutdown.
    if (context == nullptr || context->thread != nullptr) return status(CMPI_RC_OK);
    return releaseObject(context);
}

CMPIContext *contextClone(const CMPIContext *ctx, CMPIStatus *rc) {
    EncContext *context = contextOf(ctx);
    if (context == nullptr) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    std::unique_ptr<EncContext> copy = makeContext(context->cmpi.ft, context->entries);
    setRc(rc, CMPI_RC_OK);
    return &copy.release()->cmpi;
}


CMPIData getEntry(const CMPIContext *ctx, const char *name, CMPIStatus *rc) {
    EncContext *context = reportLookup(contextOf(ctx), rc);
    if (context == nullptr) return notFoundData();
    for (const NamedValue &entry : context->entries) {
        if (name != nullptr && entry.name == name) return toCmpi(entry.value);
    }
    setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return notFoundData();
}

CMPIData getEntryAt(const CMPIContext *ctx, CMPICount index, CMPIString **name,
                    CMPIStatus *rc) {
    EncContext *context = reportLookup(contextOf(ctx), rc);
    if (context == nullptr) return notFoundData();
    if (index >= context->entries.size()) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY, "entry index out of range");
        return notFoundData();
    }
    if (name != nullptr) *name = newString(context->entries[index].name);
    return toCmpi(context->entries[index].value);
}

CMPICount getEntryCount(const CMPIContext *ctx, CMPIStatus *rc) {
    EncContext *context = reportLookup(contextOf(ctx), rc);
    return context == nullptr ? 0 : static_cast<CMPICount>(context->entries.size());
}

CMPIStatus addEntry(const CMPIContext *ctx, const char *name, const CMPIValue *value,
                    CMPIType type) {
    EncContext *context = contextOf(ctx);
    if (context == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (name == nullptr) return status(CMPI_RC_ERR_INVALID_PARAMETER, "entry without a name");
    CMPIrc rc = CMPI_RC_OK;
    CimValue entry = toModel(value, type, &rc);
    if (rc != CMPI_RC_OK) return status(rc);
    for (NamedValue &existing : context->entries) {
        if (existing.name == name) {
            existing.value = std::move(entry);
            return status(CMPI_RC_OK);
        }
    }
    context->entries.push_back(NamedValue{name, std::move(entry)});
    return status(CMPI_RC_OK);
}

CMPIStatus releaseThreadObjects(const CMPIContext *ctx) {
    EncContext *context = contextOf(ctx);
    if (context == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (context->thread != nullptr) context->thread->pool.releaseAll();
    return status(CMPI_RC_OK);
}

// ---- CMPIResult ----
CMPIStatus resultRelease(CMPIResult *) { return status(CMPI_RC_OK); }

CMPIResult *resultClone(const CMPIResult *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return nullptr;
}

Response *responseOf(const CMPIResult *rslt) {
    if (rslt == nullptr || rslt->ft != &resultFT || rslt->hdl == nullptr) return nullptr;
    return static_cast<EncResult *>(rslt->hdl)->response;
}

CMPIStatus returnData(const CMPIResult *rslt, const CMPIValue *value, CMPIType type) {
    Response *response = responseOf(rslt);
    if (response == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    CMPIrc rc = CMPI_RC_OK;
    CimValue data = toModel(value, type, &rc);
    if (rc != CMPI_RC_OK) return status(rc);
    response->values.push_back(std::move(data));
    return status(CMPI_RC_OK);
}

CMPIStatus returnInstance(const CMPIResult *rslt, const CMPIInstance *inst) {
    Response *response = responseOf(rslt);
    EncInstance *instance = instanceOf(inst);
    if (response == nullptr || instance == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    response->instances.push_back(instance->value);
    return status(CMPI_RC_OK);
}

CMPIStatus returnObjectPath(const CMPIResult *rslt, const CMPIObjectPath *op) {
    Response *response = responseOf(rslt);
    EncObjectPath *path = pathOf(op);
    if (response == nullptr || path == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    response->paths.push_back(path->value);
    return status(CMPI_RC_OK);
}

CMPIStatus returnDone(const CMPIResult *rslt) {
    Response *response = responseOf(rslt);
    if (response == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    response->done = true;
    return status(CMPI_RC_OK);
}

CMPIStatus returnError(const CMPIResult *, const CMPIError *) {
    return status(CMPI_RC_ERR_NOT_SUPPORTED);
}

constexpr CMPIContextFT publishedEntries = {CMPICurrentVersion, contextRelease, contextClone, getEntry,
                                             getEntryAt,         getEntryCount,  addEntry};

}  // namespace

const CMPIContextExtFT contextFT = {publishedEntries, releaseThreadObjects};
// A table of its own, so that AddressSanitizer reports a read past its
// seventh entry as sfcb's provider process would crash on it.
const CMPIContextFT publishedContextFT = publishedEntries;

const CMPIResultFT resultFT = {CMPICurrentVersion, resultRelease,    resultClone,
                               returnData,         returnInstance,   returnObjectPath,
                               returnDone,         returnError};

std::unique_ptr<EncContext> makeContext(const CMPIContextFT *table, std::vector<NamedValue> entries) {
    auto context = makeUnpooled<EncContext>(table);
    context->entries = std::move(entries);
    return context;
}

CMPIContext *newContext(const CMPIContextFT *table, std::vector<NamedValue> entries) {
    std::unique_ptr<EncContext> context = makeContext(table, std::move(entries));
    EncContext *raw = context.get();
    ObjectPool::current().adopt(std::move(context));
    return &raw->cmpi;
}

void bindResult(EncResult &result, Response &response) {
    result.cmpi.hdl = &result;
    result.cmpi.ft = &resultFT;
    result.response = &response;
}

EncContext *contextOf(const CMPIContext *h) {
    if (h != nullptr && h->ft == &publishedContextFT) return lookup<EncContext>(h, &publishedContextFT);
    return lookup<EncContext>(h, &contextFT.base);
}

}  // namespace tvxbroker::enc

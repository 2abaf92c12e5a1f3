// The broker's side of the CMPI encapsulated types. Each object keeps plain
// model values (never pointers to other CMPI objects), so any object can be
// freed on its own, in any order.
#pragma once

#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "cmpi/cmpi_context_ext.h"
#include "core/Broker.h"
#include "core/ObjectPool.h"
#include "model/CimValue.h"
#include "model/ClassSchema.h"

namespace tvxbroker {

// A CMPI handle whose hdl points back at the object that holds it.
template <class Handle>
struct Encapsulated : PooledObject {
    Handle cmpi{};
};

struct EncString : Encapsulated<CMPIString> {
    std::string text;
    bool null = false;  // a string without characters, as sfcb returns for an absent host
};

struct EncArray : Encapsulated<CMPIArray> {
    CimValue value;  // an array value
};

struct EncDateTime : Encapsulated<CMPIDateTime> {
    DateTime value;
};

struct EncObjectPath : Encapsulated<CMPIObjectPath> {
    ObjectPath value;
};

struct EncInstance : Encapsulated<CMPIInstance> {
    Instance value;
    // Set on instances a provider made from a class: their path is then made
    // of the class's key properties, as sfcb makes it.
    const ClassSchema *schema = nullptr;
    // Lower-cased names that may be set; none means every property.
    std::optional<std::set<std::string>> filter;
};

struct EncEnumeration : Encapsulated<CMPIEnumeration> {
    std::vector<CimValue> items;
    std::size_t next = 0;
};

struct EncSelectExp : Encapsulated<CMPISelectExp> {
    std::string query;
    std::string language;
};

struct ThreadContextState;

struct EncContext : Encapsulated<CMPIContext> {
    std::vector<NamedValue> entries;
    // Set on contexts prepared for a provider thread.
    ThreadContextState *thread = nullptr;
};

struct EncResult : Encapsulated<CMPIResult> {
    Response *response = nullptr;
};

// A prepared thread context and the pool of the thread attached with it.
struct ThreadContextState {
    std::unique_ptr<EncContext> context;
    ObjectPool pool;
    std::string provider;  // whose loading prepared it; empty otherwise
};

namespace enc {

// New objects in the current pool.
CMPIString *newString(const std::string &text);
CMPIArray *newArray(CimValue arrayValue);
CMPIDateTime *newDateTime(DateTime value);
CMPIObjectPath *newObjectPath(ObjectPath value);
CMPIInstance *newInstance(Instance value);
CMPIEnumeration *newEnumeration(std::vector<CimValue> items);
CMPISelectExp *newSelectExp(std::string query, std::string language);
CMPIContext *newContext(const CMPIContextFT *table, std::vector<NamedValue> entries);

// A context that no pool owns, for thread contexts and tests.
std::unique_ptr<EncContext> makeContext(const CMPIContextFT *table, std::vector<NamedValue> entries);
void bindResult(EncResult &result, Response &response);

// The object behind a handle the broker made, or null for null and for
// anything else (a foreign or garbled handle).
EncString *stringOf(const CMPIString *handle);
EncArray *arrayOf(const CMPIArray *handle);
EncDateTime *dateTimeOf(const CMPIDateTime *handle);
EncObjectPath *pathOf(const CMPIObjectPath *handle);
EncInstance *instanceOf(const CMPIInstance *handle);
EncEnumeration *enumerationOf(const CMPIEnumeration *handle);
EncContext *contextOf(const CMPIContext *handle);
EncSelectExp *selectExpOf(const CMPISelectExp *handle);

// Which encapsulated type a handle is, by its function table; empty if none.
std::string typeNameOf(const void *handle);

// A provider's value as a model value; rc reports a bad handle or type.
CimValue toModel(const CMPIValue *value, CMPIType type, CMPIrc *rc);
// A model value as CMPI data whose objects are new in the current pool.
CMPIData toCmpi(const CimValue &value);
// Frees a pooled object now or a clone for good.
CMPIStatus releaseObject(PooledObject *object);

CMPIStatus status(CMPIrc rc);
CMPIStatus status(CMPIrc rc, const std::string &message);
void setRc(CMPIStatus *rc, CMPIrc code);
void setRc(CMPIStatus *rc, CMPIrc code, const std::string &message);

CMPIData notFoundData();

}  // namespace enc
}  // namespace tvxbroker

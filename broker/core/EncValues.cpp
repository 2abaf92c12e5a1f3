// Strings, arrays, datetimes, enumerations and select expressions.
#include "core/EncSupport.h"
#include "model/CimDateTime.h"

namespace tvxbroker::enc {

namespace {

// ---- CMPIString ----
CMPIStatus stringRelease(CMPIString *s) { return releaseOf(stringOf(s)); }
CMPIString *stringClone(const CMPIString *s, CMPIStatus *rc) { return cloneOf(stringOf(s), rc); }
char *stringCharPtr(const CMPIString *s, CMPIStatus *rc) {
    EncString *string = stringOf(s);
    if (string == nullptr) {
        setRc(rc, CMPI_RC_ERR_INVALID_HANDLE);
        return nullptr;
    }
    setRc(rc, CMPI_RC_OK);
    return string->null ? nullptr : string->text.data();
}

// ---- CMPIArray ----
CMPIStatus arrayRelease(CMPIArray *a) { return releaseOf(arrayOf(a)); }
CMPIArray *arrayClone(const CMPIArray *a, CMPIStatus *rc) { return cloneOf(arrayOf(a), rc); }


CMPICount arraySize(const CMPIArray *a, CMPIStatus *rc) {
    EncArray *array = reportLookup(arrayOf(a), rc);
    return array == nullptr ? 0 : static_cast<CMPICount>(array->value.elements.size());
}

CMPIType arraySimpleType(const CMPIArray *a, CMPIStatus *rc) {
    EncArray *array = reportLookup(arrayOf(a), rc);
    return array == nullptr ? CMPIType(CMPI_null) : array->value.elementType();
}

CMPIData arrayElementAt(const CMPIArray *a, CMPICount index, CMPIStatus *rc) {
    EncArray *array = reportLookup(arrayOf(a), rc);
    if (array == nullptr) return notFoundData();
    if (index >= array->value.elements.size()) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY, "array index out of range");
        return notFoundData();
    }
    return toCmpi(array->value.elements[index]);
}

CMPIStatus arraySetElementAt(CMPIArray *a, CMPICount index, const CMPIValue *value,
                             CMPIType type) {
    EncArray *array = arrayOf(a);
    if (array == nullptr) return status(CMPI_RC_ERR_INVALID_HANDLE);
    if (index >= array->value.elements.size()) {
        return status(CMPI_RC_ERR_NO_SUCH_PROPERTY, "array index out of range");
    }
    const CMPIType elementType = array->value.elementType();
    const bool textIntoStrings = type == CMPI_chars && elementType == CMPI_string;
    if (type != elementType && !textIntoStrings) {
        return status(CMPI_RC_ERR_TYPE_MISMATCH, "element type differs from the array's");
    }
    CMPIrc rc = CMPI_RC_OK;
    CimValue element = toModel(value, type, &rc);
    if (rc != CMPI_RC_OK) return status(rc);
    array->value.elements[index] = std::move(element);
    array->value.null = false;
    return status(CMPI_RC_OK);
}

// ---- CMPIDateTime ----
CMPIStatus dateTimeRelease(CMPIDateTime *d) { return releaseOf(dateTimeOf(d)); }
CMPIDateTime *dateTimeClone(const CMPIDateTime *d, CMPIStatus *rc) {
    return cloneOf(dateTimeOf(d), rc);
}


CMPIUint64 dateTimeBinary(const CMPIDateTime *d, CMPIStatus *rc) {
    EncDateTime *dt = reportLookup(dateTimeOf(d), rc);
    return dt == nullptr ? 0 : dt->value.microseconds;
}

CMPIString *dateTimeString(const CMPIDateTime *d, CMPIStatus *rc) {
    EncDateTime *dt = reportLookup(dateTimeOf(d), rc);
    return dt == nullptr ? nullptr : newString(formatCimDateTime(dt->value));
}

CMPIBoolean dateTimeIsInterval(const CMPIDateTime *d, CMPIStatus *rc) {
    EncDateTime *dt = reportLookup(dateTimeOf(d), rc);
    return dt != nullptr && dt->value.interval ? 1 : 0;
}

// ---- CMPIEnumeration ----
CMPIStatus enumerationRelease(CMPIEnumeration *e) { return releaseOf(enumerationOf(e)); }
CMPIEnumeration *enumerationClone(const CMPIEnumeration *e, CMPIStatus *rc) {
    return cloneOf(enumerationOf(e), rc);
}


CMPIData enumerationNext(const CMPIEnumeration *e, CMPIStatus *rc) {
    EncEnumeration *en = reportLookup(enumerationOf(e), rc);
    if (en == nullptr) return notFoundData();
    if (en->next >= en->items.size()) {
        setRc(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY, "no more elements");
        return notFoundData();
    }
    return toCmpi(en->items[en->next++]);
}

CMPIBoolean enumerationHasNext(const CMPIEnumeration *e, CMPIStatus *rc) {
    EncEnumeration *en = reportLookup(enumerationOf(e), rc);
    return en != nullptr && en->next < en->items.size() ? 1 : 0;
}

CMPIArray *enumerationToArray(const CMPIEnumeration *e, CMPIStatus *rc) {
    EncEnumeration *en = reportLookup(enumerationOf(e), rc);
    if (en == nullptr) return nullptr;
    const CMPIType elementType = en->items.empty() ? CMPIType(CMPI_instance) : en->items[0].type;
    CimValue array = CimValue::makeNull(static_cast<CMPIType>(elementType | CMPI_ARRAY));
    array.null = false;
    array.elements = en->items;
    return newArray(std::move(array));
}

// ---- CMPISelectExp ----
CMPIStatus selectExpRelease(CMPISelectExp *s) { return releaseOf(selectExpOf(s)); }
CMPISelectExp *selectExpClone(const CMPISelectExp *s, CMPIStatus *rc) {
    return cloneOf(selectExpOf(s), rc);
}
CMPIBoolean selectExpEvaluate(const CMPISelectExp *, const CMPIInstance *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return 0;
}
CMPIString *selectExpString(const CMPISelectExp *s, CMPIStatus *rc) {
    EncSelectExp *se = selectExpOf(s);
    setRc(rc, se == nullptr ? CMPI_RC_ERR_INVALID_HANDLE : CMPI_RC_OK);
    return se == nullptr ? nullptr : newString(se->query);
}
CMPISelectCond *selectExpCondition(const CMPISelectExp *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return nullptr;
}
CMPIBoolean selectExpAccessor(const CMPISelectExp *, CMPIAccessor *, void *, CMPIStatus *rc) {
    setRc(rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return 0;
}

}  // namespace

const CMPIStringFT stringFT = {CMPICurrentVersion, stringRelease, stringClone, stringCharPtr};

const CMPIArrayFT arrayFT = {CMPICurrentVersion, arrayRelease,     arrayClone,       arraySize,
                             arraySimpleType,    arrayElementAt,   arraySetElementAt};

const CMPIDateTimeFT dateTimeFT = {CMPICurrentVersion, dateTimeRelease, dateTimeClone,
                                   dateTimeBinary,     dateTimeString,  dateTimeIsInterval};

const CMPIEnumerationFT enumerationFT = {CMPICurrentVersion, enumerationRelease,
                                         enumerationClone,   enumerationNext,
                                         enumerationHasNext, enumerationToArray};

const CMPISelectExpFT selectExpFT = {CMPICurrentVersion, selectExpRelease,   selectExpClone,
                                     selectExpEvaluate,  selectExpString,    selectExpCondition,
                                     selectExpCondition, selectExpAccessor};

CMPIString *newString(const std::string &text) {
    EncString *s = makePooled<EncString>(&stringFT);
    s->text = text;
    return &s->cmpi;
}

CMPIArray *newArray(CimValue arrayValue) {
    EncArray *a = makePooled<EncArray>(&arrayFT);
    a->value = std::move(arrayValue);
    return &a->cmpi;
}

CMPIDateTime *newDateTime(DateTime value) {
    EncDateTime *d = makePooled<EncDateTime>(&dateTimeFT);
    d->value = value;
    return &d->cmpi;
}

CMPIEnumeration *newEnumeration(std::vector<CimValue> items) {
    EncEnumeration *e = makePooled<EncEnumeration>(&enumerationFT);
    e->items = std::move(items);
    return &e->cmpi;
}

CMPISelectExp *newSelectExp(std::string query, std::string language) {
    EncSelectExp *s = makePooled<EncSelectExp>(&selectExpFT);
    s->query = std::move(query);
    s->language = std::move(language);
    return &s->cmpi;
}

EncString *stringOf(const CMPIString *h) { return lookup<EncString>(h, &stringFT); }
EncArray *arrayOf(const CMPIArray *h) { return lookup<EncArray>(h, &arrayFT); }
EncDateTime *dateTimeOf(const CMPIDateTime *h) { return lookup<EncDateTime>(h, &dateTimeFT); }
EncEnumeration *enumerationOf(const CMPIEnumeration *h) {
    return lookup<EncEnumeration>(h, &enumerationFT);
}
EncSelectExp *selectExpOf(const CMPISelectExp *h) { return lookup<EncSelectExp>(h, &selectExpFT); }

}  // namespace tvxbroker::enc

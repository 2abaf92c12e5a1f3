/*
 * ConformanceC: serves Conf_CSample and Conf_CPeer from conf_samples as a C
 * provider for sfcb is written: static function tables, one instance
 * interface from <provider>_Create_InstanceMI, every object made and read
 * through the broker's tables. A CMPI_chars value is the C string itself;
 * any other type passes the address of a CMPIValue.
 */
#include <stddef.h>
#include <string.h>

#include "cmpi/cmpift.h"
#include "conformance_samples.h"

#define CP_EXPORT __attribute__((visibility("default")))
#define SAMPLE_CLASS "Conf_CSample"
#define PEER_CLASS "Conf_CPeer"

#define SET_PROPERTY(inst, name, value, type) \
    ((inst)->ft->setProperty((inst), (name), (const CMPIValue *)(value), (type)))
#define ADD_KEY(op, name, value, type) ((op)->ft->addKey((op), (name), (const CMPIValue *)(value), (type)))
#define SET_ELEMENT(array, index, value, type) \
    ((array)->ft->setElementAt((array), (index), (const CMPIValue *)(value), (type)))
#define CHARS(string) ((string)->ft->getCharPtr((string), NULL))

static const CMPIBroker *broker;

static CMPIStatus status_of(CMPIrc rc, const char *message) {
    CMPIStatus st;
    st.rc = rc;
    st.msg = message != NULL ? broker->eft->newString(broker, message, NULL) : NULL;
    return st;
}

static CMPIString *text(const char *chars) { return broker->eft->newString(broker, chars, NULL); }

/* The objects are made without checking each call, as most C providers
 * make theirs: whatever the broker fails to keep shows in what clients see. */
static CMPIObjectPath *sample_path(const char *ns, const struct conf_sample *s) {
    CMPIObjectPath *op = broker->eft->newObjectPath(broker, ns, SAMPLE_CLASS, NULL);
    CMPIValue label, slot;
    label.string = text(s->label);
    slot.uint16 = s->slot;
    ADD_KEY(op, "Name", s->name, CMPI_chars);
    ADD_KEY(op, "Label", &label, CMPI_string);
    ADD_KEY(op, "Slot", &slot, CMPI_uint16);
    return op;
}

static CMPIInstance *part_instance(const char *ns, const struct conf_sample *s) {
    CMPIObjectPath *op = broker->eft->newObjectPath(broker, ns, "Conf_Part", NULL);
    CMPIInstance *ci;
    CMPIValue size;
    ADD_KEY(op, "Id", s->part_id, CMPI_chars);
    ci = broker->eft->newInstance(broker, op, NULL);
    size.uint32 = s->part_size;
    SET_PROPERTY(ci, "Id", s->part_id, CMPI_chars);
    SET_PROPERTY(ci, "Size", &size, CMPI_uint32);
    return ci;
}

/* Names[] and Counts[] with elements left unset, and the empty Nothing[]. */
static void set_arrays(const CMPIInstance *ci) {
    CMPIArray *names = broker->eft->newArray(broker, CONF_NAMES_SIZE, CMPI_chars, NULL);
    CMPIArray *counts = broker->eft->newArray(broker, CONF_COUNTS_SIZE, CMPI_uint32, NULL);
    CMPIValue v;
    SET_ELEMENT(names, 0, CONF_NAMES_0, CMPI_chars);
    v.string = text(CONF_NAMES_2);
    SET_ELEMENT(names, 2, &v, CMPI_string);
    v.uint32 = CONF_COUNTS_0;
    SET_ELEMENT(counts, 0, &v, CMPI_uint32);
    v.uint32 = CONF_COUNTS_3;
    SET_ELEMENT(counts, 3, &v, CMPI_uint32);
    v.array = names;
    SET_PROPERTY(ci, "Names", &v, CMPI_stringA);
    v.array = counts;
    SET_PROPERTY(ci, "Counts", &v, CMPI_uint32A);
    v.array = broker->eft->newArray(broker, 0, CMPI_string, NULL);
    SET_PROPERTY(ci, "Nothing", &v, CMPI_stringA);
}

static CMPIInstance *sample_instance(const char *ns, const struct conf_sample *s) {
    CMPIInstance *ci = broker->eft->newInstance(broker, sample_path(ns, s), NULL);
    CMPIValue v;
    SET_PROPERTY(ci, "Name", s->name, CMPI_chars);
    v.string = text(s->label);
    SET_PROPERTY(ci, "Label", &v, CMPI_string);
    v.uint16 = s->slot;
    SET_PROPERTY(ci, "Slot", &v, CMPI_uint16);
    SET_PROPERTY(ci, "Text", s->text, CMPI_chars);
    v.string = text(s->made);
    SET_PROPERTY(ci, "Made", &v, CMPI_string);
    SET_PROPERTY(ci, "Missing", NULL, CMPI_chars);
    SET_PROPERTY(ci, "Vacant", NULL, CMPI_uint16);
    v.boolean = s->enabled;
    SET_PROPERTY(ci, "Enabled", &v, CMPI_boolean);
    v.uint64 = s->count;
    SET_PROPERTY(ci, "Count", &v, CMPI_uint64);
    v.sint64 = s->offset;
    SET_PROPERTY(ci, "Offset", &v, CMPI_sint64);
    v.real64 = s->ratio;
    SET_PROPERTY(ci, "Ratio", &v, CMPI_real64);
    v.dateTime = broker->eft->newDateTimeFromBinary(broker, s->taken, 0, NULL);
    SET_PROPERTY(ci, "Taken", &v, CMPI_dateTime);
    v.dateTime = broker->eft->newDateTimeFromBinary(broker, s->uptime, 1, NULL);
    SET_PROPERTY(ci, "Uptime", &v, CMPI_dateTime);
    set_arrays(ci);
    v.inst = part_instance(ns, s);
    SET_PROPERTY(ci, "Part", &v, CMPI_instance);
    return ci;
}

/* The one Conf_CPeer: references as keys, and as properties of its instance. */
static CMPIObjectPath *peer_path(const char *ns, CMPIValue *ends) {
    CMPIObjectPath *op = broker->eft->newObjectPath(broker, ns, PEER_CLASS, NULL);
    ends[0].ref = sample_path(ns, &conf_samples[0]);
    ends[1].ref = sample_path(ns, &conf_samples[1]);
    ADD_KEY(op, "Antecedent", &ends[0], CMPI_ref);
    ADD_KEY(op, "Dependent", &ends[1], CMPI_ref);
    return op;
}

static CMPIInstance *peer_instance(const char *ns) {
    CMPIValue ends[2];
    CMPIInstance *ci = broker->eft->newInstance(broker, peer_path(ns, ends), NULL);
    SET_PROPERTY(ci, "Antecedent", &ends[0], CMPI_ref);
    SET_PROPERTY(ci, "Dependent", &ends[1], CMPI_ref);
    return ci;
}

static int serves(const CMPIObjectPath *op, const char *cls) {
    return broker->eft->classPathIsA(broker, op, cls, NULL) != 0;
}

static const char *namespace_of(const CMPIObjectPath *op) {
    CMPIString *ns = op->ft->getNameSpace(op, NULL);
    return ns != NULL ? CHARS(ns) : NULL;
}

static int is_value(CMPIData d) { return (d.state & (CMPI_nullValue | CMPI_notFound)) == 0; }

/* A string key as brokers hand it over: a CMPIString, never CMPI_chars. */
static const char *key_text(const CMPIObjectPath *op, const char *name) {
    CMPIData d = op->ft->getKey(op, name, NULL);
    if (d.type != CMPI_string || !is_value(d) || d.value.string == NULL) return NULL;
    return CHARS(d.value.string);
}

static const struct conf_sample *find_sample(const CMPIObjectPath *op) {
    const char *name = key_text(op, "Name");
    const char *label = key_text(op, "Label");
    CMPIData slot = op->ft->getKey(op, "Slot", NULL);
    int i;
    /* Typed as the class declares it. */
    if (name == NULL || label == NULL || slot.type != CMPI_uint16 || !is_value(slot)) return NULL;
    for (i = 0; i < CONF_SAMPLE_COUNT; ++i) {
        const struct conf_sample *s = &conf_samples[i];
        if (strcmp(name, s->name) == 0 && strcmp(label, s->label) == 0 && slot.value.uint16 == s->slot) return s;
    }
    return NULL;
}

static const struct conf_sample *referenced_sample(const CMPIObjectPath *op, const char *key) {
    CMPIData d = op->ft->getKey(op, key, NULL);
    if (d.type != CMPI_ref || !is_value(d) || d.value.ref == NULL) return NULL;
    return find_sample(d.value.ref);
}

/* Every object of the requested class, as instances or as paths. */
static CMPIStatus return_all(const CMPIResult *rslt, const CMPIObjectPath *op, int instances) {
    CMPIStatus st = {CMPI_RC_OK, NULL};
    CMPIValue ends[2];
    const char *ns = namespace_of(op);
    const int samples = serves(op, SAMPLE_CLASS);
    const int count = samples ? CONF_SAMPLE_COUNT : serves(op, PEER_CLASS); /* one peer or none */
    int i;
    for (i = 0; i < count && st.rc == CMPI_RC_OK; ++i) {
        if (instances) {
            st = rslt->ft->returnInstance(rslt, samples ? sample_instance(ns, &conf_samples[i]) : peer_instance(ns));
        } else {
            st = rslt->ft->returnObjectPath(rslt, samples ? sample_path(ns, &conf_samples[i]) : peer_path(ns, ends));
        }
    }
    if (st.rc == CMPI_RC_OK) st = rslt->ft->returnDone(rslt);
    return st;
}

static CMPIStatus enum_instance_names(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                      const CMPIResult *rslt, const CMPIObjectPath *op) {
    (void)mi, (void)ctx;
    return return_all(rslt, op, 0);
}

static CMPIStatus enum_instances(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                 const CMPIResult *rslt, const CMPIObjectPath *op,
                                 const char **properties) {
    (void)mi, (void)ctx, (void)properties;
    return return_all(rslt, op, 1);
}

static CMPIStatus get_instance(CMPIInstanceMI *mi, const CMPIContext *ctx, const CMPIResult *rslt,
                               const CMPIObjectPath *op, const char **properties) {
    CMPIStatus st;
    const char *ns = namespace_of(op);
    const struct conf_sample *s = serves(op, SAMPLE_CLASS) ? find_sample(op) : NULL;
    CMPIInstance *ci = NULL;
    (void)mi, (void)ctx, (void)properties;
    if (s != NULL) {
        ci = sample_instance(ns, s);
    } else if (serves(op, PEER_CLASS) && referenced_sample(op, "Antecedent") == &conf_samples[0] &&
               referenced_sample(op, "Dependent") == &conf_samples[1]) {
        ci = peer_instance(ns);
    }
    if (ci == NULL) return status_of(CMPI_RC_ERR_NOT_FOUND, "no such object");
    st = rslt->ft->returnInstance(rslt, ci);
    if (st.rc == CMPI_RC_OK) st = rslt->ft->returnDone(rslt);
    return st;
}

/* The operations a read-only C provider still has to fill its table with. */
static CMPIStatus create_instance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt, const CMPIObjectPath *op,
                                  const CMPIInstance *inst) {
    (void)mi, (void)ctx, (void)rslt, (void)op, (void)inst;
    return status_of(CMPI_RC_ERR_NOT_SUPPORTED, NULL);
}

static CMPIStatus modify_instance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt, const CMPIObjectPath *op,
                                  const CMPIInstance *inst, const char **properties) {
    (void)properties;
    return create_instance(mi, ctx, rslt, op, inst);
}

static CMPIStatus delete_instance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt, const CMPIObjectPath *op) {
    return create_instance(mi, ctx, rslt, op, NULL);
}

static CMPIStatus exec_query(CMPIInstanceMI *mi, const CMPIContext *ctx, const CMPIResult *rslt,
                             const CMPIObjectPath *op, const char *query, const char *lang) {
    (void)query, (void)lang;
    return create_instance(mi, ctx, rslt, op, NULL);
}

static CMPIStatus cleanup(CMPIInstanceMI *mi, const CMPIContext *ctx, CMPIBoolean terminating) {
    (void)mi, (void)ctx, (void)terminating;
    return status_of(CMPI_RC_OK, NULL);
}

static const CMPIInstanceMIFT instance_ft = {
    CMPICurrentVersion, CMPICurrentVersion, "instanceConformanceC", cleanup,
    enum_instance_names, enum_instances, get_instance, create_instance,
    modify_instance, delete_instance, exec_query};

static CMPIInstanceMI instance_mi = {NULL, &instance_ft};

CP_EXPORT CMPIInstanceMI *ConformanceC_Create_InstanceMI(const CMPIBroker *mb,
                                                         const CMPIContext *ctx, CMPIStatus *rc) {
    (void)ctx;
    broker = mb;
    if (rc != NULL) *rc = status_of(CMPI_RC_OK, NULL);
    return &instance_mi;
}

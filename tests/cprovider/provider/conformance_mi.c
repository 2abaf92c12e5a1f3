/*
 * ConformanceC: serves Conf_CSample and Conf_CPeer from conf_samples as a C
 * provider for sfcb is written: static function tables, one instance
 * interface from <provider>_Create_InstanceMI, every object made and read
 * through the broker's tables.
 */
#include <stddef.h>
#include <string.h>

#include "cmpi_calls.h"
#include "sample_objects.h"

#define CP_EXPORT __attribute__((visibility("default")))

static const CMPIBroker *broker;

static CMPIStatus status_of(CMPIrc rc, const char *message) {
    CMPIStatus st;
    st.rc = rc;
    st.msg = message != NULL ? broker->eft->newString(broker, message, NULL) : NULL;
    return st;
}

static int serves(const CMPIObjectPath *op, const char *cls) {
    return broker->eft->classPathIsA(broker, op, cls, NULL) != 0;
}

static const char *namespace_of(const CMPIObjectPath *op) {
    CMPIString *ns = op->ft->getNameSpace(op, NULL);
    return ns != NULL ? CP_CHARS(ns) : NULL;
}

static int is_value(CMPIData d) { return (d.state & (CMPI_nullValue | CMPI_notFound)) == 0; }

/* A string key as brokers hand it over: a CMPIString, never CMPI_chars. */
static const char *key_text(const CMPIObjectPath *op, const char *name) {
    CMPIData d = CP_GET_KEY(op, name);
    if (d.type != CMPI_string || !is_value(d) || d.value.string == NULL) return NULL;
    return CP_CHARS(d.value.string);
}

/* An integer key of whichever width the client's path carries. */
static int key_number(const CMPIObjectPath *op, const char *name, CMPIUint64 *out) {
    CMPIData d = CP_GET_KEY(op, name);
    if (!is_value(d)) return 0;
    switch (d.type) {
    case CMPI_uint8: *out = d.value.uint8; return 1;
    case CMPI_uint16: *out = d.value.uint16; return 1;
    case CMPI_uint32: *out = d.value.uint32; return 1;
    case CMPI_uint64: *out = d.value.uint64; return 1;
    case CMPI_sint64: *out = (CMPIUint64)d.value.sint64; return d.value.sint64 >= 0;
    default: return 0;
    }
}

static const struct conf_sample *find_sample(const CMPIObjectPath *op) {
    const char *name = key_text(op, "Name");
    const char *label = key_text(op, "Label");
    CMPIUint64 slot = 0;
    int i;
    if (name == NULL || label == NULL || !key_number(op, "Slot", &slot)) return NULL;
    for (i = 0; i < CONF_SAMPLE_COUNT; ++i) {
        const struct conf_sample *s = &conf_samples[i];
        if (strcmp(name, s->name) == 0 && strcmp(label, s->label) == 0 && slot == s->slot) return s;
    }
    return NULL;
}

static const struct conf_sample *referenced_sample(const CMPIObjectPath *op, const char *key) {
    CMPIData d = CP_GET_KEY(op, key);
    if (d.type != CMPI_ref || !is_value(d) || d.value.ref == NULL) return NULL;
    return find_sample(d.value.ref);
}

/* Every object of the requested class, as instances or as paths. */
static CMPIStatus return_all(const CMPIResult *rslt, const CMPIObjectPath *op, int instances) {
    CMPIStatus st = {CMPI_RC_OK, NULL};
    const char *ns = namespace_of(op);
    int i;
    if (serves(op, CP_SAMPLE_CLASS)) {
        for (i = 0; i < CONF_SAMPLE_COUNT && st.rc == CMPI_RC_OK; ++i) {
            if (instances) {
                CMPIInstance *ci = sample_instance(broker, ns, &conf_samples[i], &st);
                if (ci != NULL) st = CP_RETURN_INSTANCE(rslt, ci);
            } else {
                CMPIObjectPath *path = sample_path(broker, ns, &conf_samples[i], &st);
                if (path != NULL) st = CP_RETURN_PATH(rslt, path);
            }
        }
    } else if (serves(op, CP_PEER_CLASS)) {
        if (instances) {
            CMPIInstance *ci = peer_instance(broker, ns, &st);
            if (ci != NULL) st = CP_RETURN_INSTANCE(rslt, ci);
        } else {
            CMPIObjectPath *path = peer_path(broker, ns, &st);
            if (path != NULL) st = CP_RETURN_PATH(rslt, path);
        }
    }
    if (st.rc == CMPI_RC_OK) st = CP_RETURN_DONE(rslt);
    return st;
}

static CMPIStatus enum_instance_names(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                      const CMPIResult *rslt, const CMPIObjectPath *op) {
    (void)mi;
    (void)ctx;
    return return_all(rslt, op, 0);
}

static CMPIStatus enum_instances(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                 const CMPIResult *rslt, const CMPIObjectPath *op,
                                 const char **properties) {
    (void)mi;
    (void)ctx;
    (void)properties;
    return return_all(rslt, op, 1);
}

static CMPIStatus get_instance(CMPIInstanceMI *mi, const CMPIContext *ctx, const CMPIResult *rslt,
                               const CMPIObjectPath *op, const char **properties) {
    CMPIStatus st = {CMPI_RC_OK, NULL};
    const char *ns = namespace_of(op);
    CMPIInstance *ci = NULL;
    (void)mi;
    (void)ctx;
    (void)properties;
    if (serves(op, CP_SAMPLE_CLASS)) {
        const struct conf_sample *s = find_sample(op);
        if (s != NULL) ci = sample_instance(broker, ns, s, &st);
    } else if (serves(op, CP_PEER_CLASS) && referenced_sample(op, "Antecedent") == &conf_samples[0] &&
               referenced_sample(op, "Dependent") == &conf_samples[1]) {
        ci = peer_instance(broker, ns, &st);
    }
    if (st.rc != CMPI_RC_OK) return st;
    if (ci == NULL) return status_of(CMPI_RC_ERR_NOT_FOUND, "no such object");
    st = CP_RETURN_INSTANCE(rslt, ci);
    if (st.rc == CMPI_RC_OK) st = CP_RETURN_DONE(rslt);
    return st;
}

static CMPIStatus create_instance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt, const CMPIObjectPath *op,
                                  const CMPIInstance *inst) {
    (void)mi;
    (void)ctx;
    (void)rslt;
    (void)op;
    (void)inst;
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
    (void)query;
    (void)lang;
    return create_instance(mi, ctx, rslt, op, NULL);
}

static CMPIStatus cleanup(CMPIInstanceMI *mi, const CMPIContext *ctx, CMPIBoolean terminating) {
    (void)mi;
    (void)ctx;
    (void)terminating;
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

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

/* A uint16 key, the type its class declares. */
static int key_uint16(const CMPIObjectPath *op, const char *name, CMPIUint16 *out) {
    CMPIData d = CP_GET_KEY(op, name);
    if (d.type != CMPI_uint16 || !is_value(d)) return 0;
    *out = d.value.uint16;
    return 1;
}

static const struct conf_sample *find_sample(const CMPIObjectPath *op) {
    const char *name = key_text(op, "Name");
    const char *label = key_text(op, "Label");
    CMPIUint16 slot = 0;
    int i;
    if (name == NULL || label == NULL || !key_uint16(op, "Slot", &slot)) return NULL;
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
    const int samples = serves(op, CP_SAMPLE_CLASS);
    const int count = samples ? CONF_SAMPLE_COUNT : serves(op, CP_PEER_CLASS); /* one peer or none */
    int i;
    for (i = 0; i < count && st.rc == CMPI_RC_OK; ++i) {
        if (instances) {
            CMPIInstance *ci = samples ? sample_instance(broker, ns, &conf_samples[i], &st)
                                       : peer_instance(broker, ns, &st);
            if (ci != NULL) st = CP_RETURN_INSTANCE(rslt, ci);
        } else {
            CMPIObjectPath *path = samples ? sample_path(broker, ns, &conf_samples[i], &st)
                                           : peer_path(broker, ns, &st);
            if (path != NULL) st = CP_RETURN_PATH(rslt, path);
        }
    }
    if (st.rc == CMPI_RC_OK) st = CP_RETURN_DONE(rslt);
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
    CMPIStatus st = {CMPI_RC_OK, NULL};
    const char *ns = namespace_of(op);
    CMPIInstance *ci = NULL;
    (void)mi, (void)ctx, (void)properties;
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

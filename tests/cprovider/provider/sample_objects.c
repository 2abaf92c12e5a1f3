#include "sample_objects.h"

#include <stddef.h>

#include "cmpi_calls.h"

/* Keeps the first failure of a run of calls. */
static void keep(CMPIStatus *st, CMPIStatus next) {
    if (st->rc == CMPI_RC_OK) *st = next;
}

/* What a broker call that reported into *rc made; null, with the failure
 * kept, when it made nothing. */
static void *made(void *object, const CMPIStatus *rc, CMPIStatus *st) {
    CMPIStatus failed;
    if (object != NULL) return object;
    failed = *rc;
    if (failed.rc == CMPI_RC_OK) failed.rc = CMPI_RC_ERR_FAILED;
    keep(st, failed);
    return NULL;
}

CMPIObjectPath *sample_path(const CMPIBroker *mb, const char *ns, const struct conf_sample *s,
                            CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIObjectPath *op = made(mb->eft->newObjectPath(mb, ns, CP_SAMPLE_CLASS, &rc), &rc, st);
    CMPIValue label, slot;
    if (op == NULL) return NULL;
    label.string = made(mb->eft->newString(mb, s->label, &rc), &rc, st);
    slot.uint16 = s->slot;
    keep(st, CP_ADD_KEY(op, "Name", s->name, CMPI_chars));
    keep(st, CP_ADD_KEY(op, "Label", &label, CMPI_string));
    keep(st, CP_ADD_KEY(op, "Slot", &slot, CMPI_uint16));
    return st->rc == CMPI_RC_OK ? op : NULL;
}

static CMPIInstance *part_instance(const CMPIBroker *mb, const char *ns,
                                   const struct conf_sample *s, CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIObjectPath *op = made(mb->eft->newObjectPath(mb, ns, "Conf_Part", &rc), &rc, st);
    CMPIInstance *ci;
    CMPIValue size;
    if (op == NULL) return NULL;
    keep(st, CP_ADD_KEY(op, "Id", s->part_id, CMPI_chars));
    ci = made(mb->eft->newInstance(mb, op, &rc), &rc, st);
    if (ci == NULL) return NULL;
    size.uint32 = s->part_size;
    keep(st, CP_SET_PROPERTY(ci, "Id", s->part_id, CMPI_chars));
    keep(st, CP_SET_PROPERTY(ci, "Size", &size, CMPI_uint32));
    return ci;
}

/* Names[], Counts[] with elements left unset, and the empty Nothing[]. */
static void set_arrays(const CMPIBroker *mb, const CMPIInstance *ci, CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIArray *names = made(mb->eft->newArray(mb, CONF_NAMES_SIZE, CMPI_chars, &rc), &rc, st);
    CMPIArray *counts = made(mb->eft->newArray(mb, CONF_COUNTS_SIZE, CMPI_uint32, &rc), &rc, st);
    CMPIArray *nothing = made(mb->eft->newArray(mb, 0, CMPI_string, &rc), &rc, st);
    CMPIValue v;
    if (names == NULL || counts == NULL || nothing == NULL) return;
    keep(st, CP_SET_ELEMENT(names, 0, CONF_NAMES_0, CMPI_chars));
    v.string = made(mb->eft->newString(mb, CONF_NAMES_2, &rc), &rc, st);
    keep(st, CP_SET_ELEMENT(names, 2, &v, CMPI_string));
    v.uint32 = CONF_COUNTS_0;
    keep(st, CP_SET_ELEMENT(counts, 0, &v, CMPI_uint32));
    v.uint32 = CONF_COUNTS_3;
    keep(st, CP_SET_ELEMENT(counts, 3, &v, CMPI_uint32));
    v.array = names;
    keep(st, CP_SET_PROPERTY(ci, "Names", &v, CMPI_stringA));
    v.array = counts;
    keep(st, CP_SET_PROPERTY(ci, "Counts", &v, CMPI_uint32A));
    v.array = nothing;
    keep(st, CP_SET_PROPERTY(ci, "Nothing", &v, CMPI_stringA));
}

CMPIInstance *sample_instance(const CMPIBroker *mb, const char *ns, const struct conf_sample *s,
                              CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIObjectPath *op = sample_path(mb, ns, s, st);
    CMPIInstance *ci = op != NULL ? made(mb->eft->newInstance(mb, op, &rc), &rc, st) : NULL;
    CMPIValue v;
    if (ci == NULL) return NULL;
    keep(st, CP_SET_PROPERTY(ci, "Name", s->name, CMPI_chars));
    v.string = made(mb->eft->newString(mb, s->label, &rc), &rc, st);
    keep(st, CP_SET_PROPERTY(ci, "Label", &v, CMPI_string));
    v.uint16 = s->slot;
    keep(st, CP_SET_PROPERTY(ci, "Slot", &v, CMPI_uint16));
    keep(st, CP_SET_PROPERTY(ci, "Text", s->text, CMPI_chars));
    v.string = made(mb->eft->newString(mb, s->made, &rc), &rc, st);
    keep(st, CP_SET_PROPERTY(ci, "Made", &v, CMPI_string));
    keep(st, CP_SET_PROPERTY(ci, "Missing", NULL, CMPI_chars));
    v.boolean = s->enabled;
    keep(st, CP_SET_PROPERTY(ci, "Enabled", &v, CMPI_boolean));
    v.uint64 = s->count;
    keep(st, CP_SET_PROPERTY(ci, "Count", &v, CMPI_uint64));
    v.sint64 = s->offset;
    keep(st, CP_SET_PROPERTY(ci, "Offset", &v, CMPI_sint64));
    v.real64 = s->ratio;
    keep(st, CP_SET_PROPERTY(ci, "Ratio", &v, CMPI_real64));
    v.dateTime = made(mb->eft->newDateTimeFromBinary(mb, s->taken, 0, &rc), &rc, st);
    keep(st, CP_SET_PROPERTY(ci, "Taken", &v, CMPI_dateTime));
    v.dateTime = made(mb->eft->newDateTimeFromBinary(mb, s->uptime, 1, &rc), &rc, st);
    keep(st, CP_SET_PROPERTY(ci, "Uptime", &v, CMPI_dateTime));
    set_arrays(mb, ci, st);
    v.inst = part_instance(mb, ns, s, st);
    keep(st, CP_SET_PROPERTY(ci, "Part", &v, CMPI_instance));
    return st->rc == CMPI_RC_OK ? ci : NULL;
}

CMPIObjectPath *peer_path(const CMPIBroker *mb, const char *ns, CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIObjectPath *op = made(mb->eft->newObjectPath(mb, ns, CP_PEER_CLASS, &rc), &rc, st);
    CMPIValue antecedent, dependent;
    antecedent.ref = sample_path(mb, ns, &conf_samples[0], st);
    dependent.ref = sample_path(mb, ns, &conf_samples[1], st);
    if (op == NULL || st->rc != CMPI_RC_OK) return NULL;
    keep(st, CP_ADD_KEY(op, "Antecedent", &antecedent, CMPI_ref));
    keep(st, CP_ADD_KEY(op, "Dependent", &dependent, CMPI_ref));
    return st->rc == CMPI_RC_OK ? op : NULL;
}

CMPIInstance *peer_instance(const CMPIBroker *mb, const char *ns, CMPIStatus *st) {
    CMPIStatus rc = {CMPI_RC_OK, NULL};
    CMPIObjectPath *op = peer_path(mb, ns, st);
    CMPIInstance *ci = op != NULL ? made(mb->eft->newInstance(mb, op, &rc), &rc, st) : NULL;
    CMPIValue v;
    if (ci == NULL) return NULL;
    v.ref = sample_path(mb, ns, &conf_samples[0], st);
    keep(st, CP_SET_PROPERTY(ci, "Antecedent", &v, CMPI_ref));
    v.ref = sample_path(mb, ns, &conf_samples[1], st);
    keep(st, CP_SET_PROPERTY(ci, "Dependent", &v, CMPI_ref));
    return st->rc == CMPI_RC_OK ? ci : NULL;
}

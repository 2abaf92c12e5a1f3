/*
 * The objects of the conformance provider, built from conf_samples with the
 * broker's services. Each returns null and leaves the broker's status in
 * *st when a call fails; *st must come in as OK.
 */
#ifndef TVX_CPROVIDER_SAMPLE_OBJECTS_H
#define TVX_CPROVIDER_SAMPLE_OBJECTS_H

#include "conformance_samples.h"
#include "cmpi/cmpift.h"

#define CP_SAMPLE_CLASS "Conf_CSample"
#define CP_PEER_CLASS "Conf_CPeer"

CMPIObjectPath *sample_path(const CMPIBroker *mb, const char *ns, const struct conf_sample *s,
                            CMPIStatus *st);
CMPIInstance *sample_instance(const CMPIBroker *mb, const char *ns, const struct conf_sample *s,
                              CMPIStatus *st);
CMPIObjectPath *peer_path(const CMPIBroker *mb, const char *ns, CMPIStatus *st);
CMPIInstance *peer_instance(const CMPIBroker *mb, const char *ns, CMPIStatus *st);

#endif

// An instance factory that hands the broker no interface at all.
#include "cmpi/cmpift.h"

extern "C" __attribute__((visibility("default"))) CMPIInstanceMI *NullProvider_Create_InstanceMI(
    CMPIBroker *, const CMPIContext *, CMPIStatus *) {
    return nullptr;
}

// The embedded broker loaded with the OMC test providers.
#pragma once

#include "core/Broker.h"

namespace omctest {

inline tvxbroker::BrokerConfig omcTestConfig() {
    return tvxbroker::loadBrokerConfig({TVX_OMCTESTPROVIDER_DIR}, TVX_OMCTESTPROVIDER_REG,
                                       {TVX_OMCTESTPROVIDER_MOF});
}

}  // namespace omctest

// What the kernel reports once for the whole host and every package shares:
// the model text, hardware threads and the power policy.
#pragma once

#include <cstddef>

#include "processor/ProcessorDetails.h"

namespace Processor {

struct HostProcessorSettings {
    unsigned char powerPolicy[588];     // node 1443
    unsigned char hardwareThreads[36];  // node 605
    unsigned char modelText[48];        // node 606, not necessarily terminated
};

// Fills modelName, hyperThreading, powerManagement and dynamicPower.
void applyHostSettings(const HostProcessorSettings &host, ProcessorDetails &details);

}  // namespace Processor

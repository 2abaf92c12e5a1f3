// One physical processor package as the inventory reports it.
#pragma once

#include <cstdint>

namespace Processor {

struct ProcessorDetails {
    uint32_t vendor;        // 1 other, 2 Intel, 3 AMD
    char deviceId[64];      // "cpu-<position in the package list>"
    uint32_t enabledCores;  // also the package's run of entries in the core list
    char modelName[48];
    char stepping[8];
    uint8_t brandId;
    uint8_t hyperThreading;
    uint8_t virtualization;
    uint8_t noExecute;
    uint8_t longMode;
    uint8_t powerManagement;
    uint8_t dynamicPower;
    uint32_t cpuStatus;  // 1 enabled, 4 idle
};

}  // namespace Processor

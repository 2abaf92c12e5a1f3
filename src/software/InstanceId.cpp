#include "software/InstanceId.h"

#include <cstdint>
#include <cstring>

namespace Software {

std::string makeInstanceId(const SystemVersionInfo &record) {
    std::string id = isRunningImage(record) ? "" : std::string(altBootBankPrefix) + " ";
    id += fieldText(record.productName) + " " + fieldText(record.versionText) + " build-" +
          std::to_string(static_cast<std::uint32_t>(record.buildNumber));
    return id;
}

bool isAltBootBankId(const char *instanceId) {
    return instanceId != nullptr && std::strncmp(instanceId, altBootBankPrefix, std::strlen(altBootBankPrefix)) == 0;
}

}  // namespace Software

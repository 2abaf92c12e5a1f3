#include "ethernet/LinkSettings.h"

#include <fcntl.h>
#include <linux/ethtool.h>
#include <net/if.h>
#include <sys/socket.h>

#include <cstdio>
#include <cstring>

#include "ethernet/EthtoolRequest.h"
#include "platform/FileDescriptor.h"
#include "platform/OskUser.h"

namespace EthernetProvider {
namespace {

struct PortTypeRow {
    uint8_t port;
    uint16_t speedMbps;
    uint32_t portType;
};

constexpr PortTypeRow portTypes[] = {
    {PORT_TP, 10, 50},      {PORT_TP, 100, 52},       {PORT_TP, 1000, 53},
    {PORT_TP, 2500, 54},    {PORT_TP, 10000, 55},     {PORT_FIBRE, 100, 100},
    {PORT_FIBRE, 1000, 102}, {PORT_FIBRE, 10000, 105},
};

int openEthtoolChannel(const char *requestName) {
    int inServiceConsole = 0;
    OskuserCompat_InCOS(&inServiceConsole);
    if (inServiceConsole != 0) return ::socket(AF_INET, SOCK_DGRAM, 0);
    char path[256];
    formatDriverDevicePath(path, sizeof path, requestName);
    return ::open(path, O_RDWR | O_LARGEFILE);
}

}  // namespace

uint32_t portTypeFor(uint8_t port, uint16_t speedMbps) {
    for (const PortTypeRow &row : portTypes) {
        if (row.port == port && row.speedMbps == speedMbps) return row.portType;
    }
    return 0;
}

void formatDriverDevicePath(char *path, std::size_t pathSize, const char *requestName) {
    std::snprintf(path, pathSize, "/dev/char/oskdriver/%s", requestName);
}

void queryLinkSettings(const char *adapterName, PnicDetails &details) {
    ifreq request;
    std::memset(&request, 0, sizeof request);
    std::strncpy(request.ifr_name, adapterName, IFNAMSIZ);
    request.ifr_name[IFNAMSIZ - 1] = '\0';

    platform::FileDescriptor channel(openEthtoolChannel(request.ifr_name));
    if (!channel.valid()) return;

    ethtool_cmd command;
    std::memset(&command, 0, sizeof command);
    command.cmd = ETHTOOL_GSET;
    request.ifr_data = reinterpret_cast<char *>(&command);
    if (issueEthtoolRequest(channel.get(), &request) < 0) return;

    details.autoSense = (command.supported & SUPPORTED_Autoneg) != 0 ? 1 : 0;
    details.portType = portTypeFor(command.port, command.speed);
}

}  // namespace EthernetProvider

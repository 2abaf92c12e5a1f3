#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "ErrorText.h"
#include "model/ProviderRegistration.h"

namespace tvxbroker {
namespace {

// The plain layout is read in every broker test; here what it may vary in.
TEST(ProviderRegistration, ReadsBlocks) {
    const std::vector<ProviderRegistration> regs = parseRegistration(
        "[TVX_Disk]\n"
        "   provider: TvxDiskProvider\n"
        "   location: tvxdisk\r\n"
        "   type: instance method\n"
        "   namespace: root/cimv2 root/interop\n"
        "   group: tvx\n"
        "   unload: never\n"
        "  # between blocks\n"
        "[TVX_DiskLink]\n"
        "provider:TvxLinkProvider\n"
        "location:  tvxlink\n"
        "type:association\tindication\n"
        "namespace: root/cimv2\n",
        "reg");
    ASSERT_EQ(regs.size(), 2u);
    const ProviderRegistration &disk = regs[0];
    EXPECT_EQ(disk.location, "tvxdisk");
    EXPECT_TRUE(disk.instance && disk.method);
    EXPECT_EQ(disk.namespaces, (std::vector<std::string>{"root/cimv2", "root/interop"}));
    EXPECT_EQ(disk.group, "tvx");
    EXPECT_TRUE(disk.unloadNever);
    const ProviderRegistration &link = regs[1];
    EXPECT_EQ(link.location, "tvxlink");
    EXPECT_TRUE(link.association && link.indication);
    EXPECT_FALSE(link.instance || link.method || link.unloadNever);
    EXPECT_EQ(link.group, "");
    EXPECT_TRUE(parseRegistration("", "empty").empty());
}

TEST(ProviderRegistration, ErrorsNameTheLine) {
    const std::string block = "[C]\n provider: P\n location: l\n type: instance\n namespace: root/cimv2\n";
    const std::pair<std::string, std::string> cases[] = {
        {"[C]\n vendor: x\n", "reg:2: unknown key 'vendor'"},
        {"[C]\n group: tvx heartbeat\n", "reg:2: group takes one name, not 'tvx heartbeat'"},
        {"[C]\n provider: P\n location: l\n type: method\n[D]\n", "reg:1: block [C] has no namespace"},
        {block + "\n[c]\n", "reg:7: class c is registered twice"},
        {std::string("[C]\n\0\x01\xff\n", 8), "reg:2: expected 'key: value'"},
    };
    for (const auto &c : cases) EXPECT_EQ(errorOf([&] { parseRegistration(c.first, "reg"); }), c.second) << c.first;
}

}  // namespace
}  // namespace tvxbroker

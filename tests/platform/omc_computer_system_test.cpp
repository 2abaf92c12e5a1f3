#include <gtest/gtest.h>

#include <sys/utsname.h>

#include "platform/OmcComputerSystem.h"

namespace {

TEST(OmcComputerSystem, KeysNameTheHostTheWayTheSystemDoes) {
    utsname host{};
    ASSERT_EQ(uname(&host), 0);
    EXPECT_EQ(OMC::getComputerSystemName(CmpiContext(), nullptr), host.nodename);
    EXPECT_EQ(OMC::getComputerSystemClassName(), "OMC_UnitaryComputerSystem");
}

}  // namespace

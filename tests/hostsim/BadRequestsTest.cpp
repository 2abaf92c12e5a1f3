#include "HostSimTesting.h"

namespace hostsim_test {
namespace {

class HostSimBadRequests : public HostSimTest {};

TEST_F(HostSimBadRequests, FailWithTheirStatusAndLeaveTheBufferAlone) {
    const std::tuple<const char *, int, std::vector<Param>, std::size_t, int> cases[] = {
        {"record one byte short", 72, {"vmnic0"}, 1251, HOSTSIM_STATUS_BAD_SIZE},
        {"state record one byte long", 799, {std::int64_t{0}}, 161, HOSTSIM_STATUS_BAD_SIZE},
        {"unknown node", 71, {"vmnic0"}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"node without a value", 70, {}, 4, HOSTSIM_STATUS_UNKNOWN_NODE},
        {"unknown adapter", 72, {"vmnic9"}, 1252, HOSTSIM_STATUS_NOT_FOUND},
        {"unknown core", 607, {std::int64_t{4}}, 200, HOSTSIM_STATUS_NOT_FOUND},
        {"core beyond 32 bits", 799, {std::int64_t{1} << 32}, 160, HOSTSIM_STATUS_NOT_FOUND},
        {"two names", 74, {"vmnic0", "vmnic0"}, 4, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"core named by text", 607, {"0"}, 200, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"no core named", 800, {}, 76, HOSTSIM_STATUS_BAD_ARGUMENT},
        {"host-wide node with a parameter", 606, {std::int64_t{0}}, 48, HOSTSIM_STATUS_BAD_ARGUMENT},
    };
    serve(host({{{"name", "vmnic0"}}}, {}, {{"packages", {{{"cores", {{{"count", 4}}}}}}}}));
    for (const auto &[what, node, params, size, status] : cases) {
        Bytes buffer(size, 0xa5);
        EXPECT_EQ(readNode(node, params, buffer), status) << what;
        EXPECT_EQ(buffer, Bytes(size, 0xa5)) << what;
    }
    int status = -1;
    EXPECT_EQ(instanceList(72, &status), nullptr);
    EXPECT_EQ(status, HOSTSIM_STATUS_UNKNOWN_NODE);
    const List parent = listOf({std::int64_t{0}});
    PRB_ParamList *list = nullptr;
    EXPECT_EQ(PRB_GetInstanceListAlloc(607, parent.get(), &list), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(list, nullptr);
    char workArea[21];
    EXPECT_EQ(PRB_CheckSig(workArea, 20, &status), HOSTSIM_STATUS_BAD_ARGUMENT);
    EXPECT_EQ(PRB_CheckSig(workArea, 21, &status), HOSTSIM_STATUS_OK);
}

}  // namespace
}  // namespace hostsim_test

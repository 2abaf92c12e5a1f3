// Ports and their driver and firmware identities, followed in both
// directions through the broker with every filter a client can give. The
// traversal works from the paths alone, so it answers even on a host whose
// inventory fails.
#include "EthernetBroker.h"

namespace ethernettest {
namespace {

const std::string driverNic0 =
    "root/cimv2:Talvex_EPDriverSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPDriverSoftwareIdentity:nic0\"";
const std::string firmwareNic0 =
    "root/cimv2:Talvex_EPFirmwareSoftwareIdentity.InstanceID=\"Talvex:Talvex_EPFirmwareSoftwareIdentity:nic0\"";

struct Filters {
    std::string assocClass, resultClass, role, resultRole;
};

class EthernetAssociations : public EthernetBroker {
protected:
    void SetUp() override {
        EthernetBroker::SetUp();
        serve(twoAdapterProfile(R"({"call": "PRB_CheckSig"})"));
    }
    std::vector<std::string> associatorNames(const ObjectPath &source, const Filters &f) {
        const Response response =
            broker->associatorNames(source, f.assocClass, f.resultClass, f.role, f.resultRole);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << response.message.value_or("");
        return pathTexts(response);
    }
};

TEST_F(EthernetAssociations, FromAPortEveryFilterNarrowsTheIdentities) {
    const struct {
        const char *what;
        Filters filters;
        std::vector<std::string> found;
    } cases[] = {
        {"no filter", {}, {driverNic0, firmwareNic0}},
        {"result class firmware", {"", "Talvex_EPFirmwareSoftwareIdentity", "", ""}, {firmwareNic0}},
        {"result class base", {"", "CIM_SoftwareIdentity", "", ""}, {driverNic0, firmwareNic0}},
        {"association class driver", {"Talvex_EPDriverElementSoftwareIdentity", "", "", ""}, {driverNic0}},
        {"association and result class disagree",
         {"Talvex_EPDriverElementSoftwareIdentity", "Talvex_EPFirmwareSoftwareIdentity", "", ""}, {}},
        {"role Dependent, any case", {"", "", "dependent", "ANTECEDENT"}, {driverNic0, firmwareNic0}},
        {"role Antecedent", {"", "", "Antecedent", ""}, {}},
        {"result role Dependent", {"", "", "", "Dependent"}, {}},
    };
    for (const auto &c : cases) EXPECT_EQ(associatorNames(portPath("nic0"), c.filters), c.found) << c.what;
}

TEST_F(EthernetAssociations, FromAnIdentityTheOnePort) {
    const ObjectPath firmware =
        identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic3");
    const std::string port = formatPath(portPath("nic3"));
    const struct {
        const char *what;
        Filters filters;
        std::vector<std::string> found;
    } cases[] = {
        {"no filter", {}, {port}},
        {"result class base of the port", {"", "CIM_NetworkPort", "Antecedent", "Dependent"}, {port}},
        {"result class elsewhere", {"", "Talvex_EPDriverSoftwareIdentity", "", ""}, {}},
        {"role Dependent", {"", "", "Dependent", ""}, {}},
        {"result role Antecedent", {"", "", "", "Antecedent"}, {}},
    };
    for (const auto &c : cases) EXPECT_EQ(associatorNames(firmware, c.filters), c.found) << c.what;
}

TEST_F(EthernetAssociations, ReferencesCarryBothEndsAndNoStatus) {
    const Response refs = broker->references(portPath("nic9"), "", "", std::nullopt);
    ASSERT_EQ(refs.rc, CMPI_RC_OK) << refs.message.value_or("");
    ASSERT_EQ(refs.instances.size(), 2u) << "a port that does not exist still has both";
    EXPECT_EQ(refs.instances[0].path.className, "Talvex_EPDriverElementSoftwareIdentity");
    EXPECT_EQ(literals(refs.instances[0]).size(), 2u);
    EXPECT_EQ(referenceText(refs.instances[0], "Dependent"), formatPath(portPath("nic9")));
}

}  // namespace
}  // namespace ethernettest

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

class EthernetAssociations : public EthernetBroker {
protected:
    void SetUp() override {
        EthernetBroker::SetUp();
        serve(twoAdapterProfile(R"({"call": "PRB_CheckSig"})"));
    }
};

TEST_F(EthernetAssociations, EveryFilterNarrowsWhatIsFoundFromEitherEnd) {
    const ObjectPath port = portPath("nic0");
    const ObjectPath firmware =
        identityPath("Talvex_EPFirmwareSoftwareIdentity", "Talvex:Talvex_EPFirmwareSoftwareIdentity:nic3");
    const std::string portNic3 = formatPath(portPath("nic3"));
    const struct {
        const char *what;
        const ObjectPath &from;
        std::string assocClass, resultClass, role, resultRole;
        std::vector<std::string> found;
    } cases[] = {
        {"no filter", port, "", "", "", "", {driverNic0, firmwareNic0}},
        {"result class firmware", port, "", "Talvex_EPFirmwareSoftwareIdentity", "", "", {firmwareNic0}},
        {"association class driver", port, "Talvex_EPDriverElementSoftwareIdentity", "", "", "", {driverNic0}},
        {"association and result class disagree", port, "Talvex_EPDriverElementSoftwareIdentity",
         "Talvex_EPFirmwareSoftwareIdentity", "", "", {}},
        {"role Dependent, any case", port, "", "", "dependent", "ANTECEDENT", {driverNic0, firmwareNic0}},
        {"role Antecedent", port, "", "", "Antecedent", "", {}},
        {"identity, no filter", firmware, "", "", "", "", {portNic3}},
        {"identity, result class base of the port", firmware, "", "CIM_NetworkPort", "Antecedent", "Dependent",
         {portNic3}},
        {"identity, role Dependent", firmware, "", "", "Dependent", "", {}},
    };
    for (const auto &c : cases) {
        const Response response = broker->associatorNames(c.from, c.assocClass, c.resultClass, c.role, c.resultRole);
        EXPECT_EQ(response.rc, CMPI_RC_OK) << c.what << ": " << response.message.value_or("");
        EXPECT_EQ(pathTexts(response), c.found) << c.what;
    }
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

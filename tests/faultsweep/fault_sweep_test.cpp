// Every platform call the stand-in host can fail, failed at each of its call
// positions in turn, under every request a client can send to every class
// the product registers. Each answer must be what the provider's failure
// handling promises, and every platform list and broker object must be
// given back. A position is swept while the fault rule counts it as
// reached, so new calls join the sweep by themselves.
#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "ClientView.h"
#include "core/Broker.h"
#include "hostsim/HostSimControl.h"
#include "model/MofInstanceText.h"
#include "model/PathText.h"

namespace {

using namespace tvxbroker;
using nlohmann::json;

struct PlatformCall {
    const char *name;
    json rule;  // a fault rule failing every such call, before "nth" is added
};

const PlatformCall platformCalls[] = {
    {"PRB_CheckSig", {{"call", "PRB_CheckSig"}}},
    {"PRB_GetInstanceListAlloc", {{"call", "PRB_GetInstanceListAlloc"}}},
    {"PRB_GetInstanceListAlloc without a list", {{"call", "PRB_GetInstanceListAlloc"}, {"noList", true}}},
    {"PRB_Get", {{"call", "PRB_Get"}}},
    {"PRB_ParamListCreate", {{"call", "PRB_ParamListCreate"}}},
    {"PRB_ParamListAddString", {{"call", "PRB_ParamListAddString"}}},
    {"PRB_ParamListAddInt", {{"call", "PRB_ParamListAddInt"}}},
    {"PRB_ParamListGetString", {{"call", "PRB_ParamListGetString"}}},
    {"PRB_ParamListGetInt32", {{"call", "PRB_ParamListGetInt32"}}},
    {"PRB_ParamListGetParam", {{"call", "PRB_ParamListGetParam"}}},
    {"OskuserVersion_GetSystemVersion", {{"call", "OskuserVersion_GetSystemVersion"}}},
};

// Far more positions than any request on the default host reaches: only a
// call made in a loop that never ends gets there.
constexpr std::uint64_t kRunawayPosition = 100000;

constexpr const char *kBootBank = "TVX_ALTBOOTBANK_CFG";

enum class Operation { EnumInstanceNames, EnumInstances, GetInstance, Associators, AssociatorNames, References, ReferenceNames };
const char *const kOperationNames[] = {"enumInstanceNames", "enumInstances", "getInstance", "associators",
                                       "associatorNames", "references", "referenceNames"};

enum class Outcome {
    Unchanged,  // the clean answer
    SameNames,  // the clean answer's objects, with values the provider falls back on
    Fewer,      // OK with some clean elements left out, the rest in order; getInstance may find none
    Nothing,    // OK and empty; getInstance finds none
    Failed,     // the provider's error, and nothing returned before it
};

struct Documented {
    Outcome outcome;
    CMPIrc rc = CMPI_RC_OK;
    const char *message = nullptr;
};

// What each provider's failure handling promises when `call` fails under
// `operation` on a class it serves.
Documented documented(const std::string &provider, const PlatformCall &call, Operation operation) {
    const std::string failed = call.rule["call"];
    if (provider == "EthernetPortProvider") {
        // Traversal reads the source path only; associators fetch the far
        // ends by enumeration, which leaves out an end whose enumeration fails.
        if (operation == Operation::Associators) return {Outcome::Fewer};
        // No list to name the adapter: a shorter, successful inventory.
        if (failed == "PRB_ParamListCreate") return {Outcome::Fewer};
        if (call.rule.contains("noList")) return {Outcome::Nothing};
        return {Outcome::Failed, CMPI_RC_ERR_FAILED, "Failed to get pnics information"};
    }
    // A failed walk answers nothing; an address that cannot be read leaves
    // out its endpoint.
    if (provider == "KernelIPProtocolEndpointProvider") return {Outcome::Fewer};
    if (provider == "TalvexProcessorProvider") return {Outcome::Nothing};
    // A failed version query gives the running image the default version.
    if (provider == "HypervisorSoftwareIdentity" || provider == "TalvexInstalledSoftwareIdentity") {
        return {Outcome::SameNames};
    }
    ADD_FAILURE() << provider << " reached " << call.name << ", and no outcome of its failure is known";
    return {Outcome::Unchanged};
}

// What a response returned, one text per element, in order: its path, and
// with `values` an instance's properties too.
std::vector<std::string> elementsOf(const Response &response, bool values = true) {
    std::vector<std::string> texts;
    for (const ObjectPath &path : response.paths) texts.push_back(formatPath(path));
    for (const Instance &instance : response.instances) {
        texts.push_back(formatPath(instance.path) + (values ? "\n" + formatInstanceMof(instance) : ""));
    }
    return texts;
}

bool inOrderWithin(const std::vector<std::string> &part, const std::vector<std::string> &whole) {
    auto next = whole.begin();
    for (const std::string &element : part) {
        while (next != whole.end() && *next != element) ++next;
        if (next == whole.end()) return false;
        ++next;
    }
    return true;
}

void checkAnswer(const Documented &expected, Operation operation, const Response &clean, const Response &got) {
    const std::vector<std::string> elements = elementsOf(got);
    if (!got.ok()) {
        EXPECT_TRUE(elements.empty() && got.values.empty()) << "an error answer carries results";
    }
    const bool foundNone = operation == Operation::GetInstance && got.rc == CMPI_RC_ERR_NOT_FOUND;
    switch (expected.outcome) {
        case Outcome::Unchanged:
            EXPECT_EQ(got.rc, clean.rc);
            EXPECT_EQ(elements, elementsOf(clean));
            break;
        case Outcome::SameNames:
            EXPECT_EQ(got.rc, clean.rc);
            EXPECT_EQ(elementsOf(got, false), elementsOf(clean, false));
            break;
        case Outcome::Fewer:
            if (!foundNone) {
                EXPECT_EQ(got.rc, clean.rc) << got.message.value_or("");
            }
            EXPECT_TRUE(inOrderWithin(elements, elementsOf(clean))) << "answers what the clean run did not";
            break;
        case Outcome::Nothing:
            EXPECT_EQ(got.rc, operation == Operation::GetInstance ? CMPI_RC_ERR_NOT_FOUND : CMPI_RC_OK);
            EXPECT_TRUE(elements.empty());
            break;
        case Outcome::Failed:
            EXPECT_EQ(got.rc, expected.rc);
            EXPECT_EQ(got.message.value_or(""), expected.message);
            EXPECT_FALSE(got.done) << "an error answer signals the end of results";
            break;
    }
}

// The built-in host, with no fault.
json cleanHost() {
    json host = json::parse(HostSim_DefaultProfileText());
    host["faults"] = json::array();
    return host;
}

class FaultSweep : public testing::TestWithParam<std::string> {
protected:
    // Threads past their first cycle leave the platform to the request
    // under test.
    void SetUp() override { ASSERT_TRUE(consistency::loadInstanceProviders(broker, std::chrono::seconds(60))); }

    void TearDown() override {
        broker.shutdown();
        EXPECT_EQ(HostSim_LiveListCount(), 0u);
        HostSim_ResetProfile();
    }

    const ProviderRegistration &registration() const {
        for (const ProviderRegistration &candidate : broker.registrations()) {
            if (equalsIgnoreCase(candidate.className, GetParam())) return candidate;
        }
        throw std::runtime_error(GetParam() + " is not registered");
    }

    ObjectPath classPath() const { return ObjectPath{"", registration().namespaces.front(), GetParam(), {}}; }

    Response send(Operation operation, const ObjectPath &path) {
        switch (operation) {
            case Operation::EnumInstanceNames: return broker.enumInstanceNames(path);
            case Operation::EnumInstances: return broker.enumInstances(path, std::nullopt);
            case Operation::GetInstance: return broker.getInstance(path, std::nullopt);
            case Operation::Associators: return broker.associators(path, GetParam(), "", "", "", std::nullopt);
            case Operation::AssociatorNames: return broker.associatorNames(path, GetParam(), "", "", "");
            case Operation::References: return broker.references(path, GetParam(), "", std::nullopt);
            case Operation::ReferenceNames: return broker.referenceNames(path, GetParam(), "");
        }
        return {};
    }

    static void serve(const json &host) {
        char error[256];
        EXPECT_EQ(HostSim_LoadProfileText(host.dump().c_str(), error, sizeof error), 0) << error;
    }

    // One request on a freshly loaded `host`: every list and broker object
    // it used is given back when it ends.
    Response sendOn(const json &host, Operation operation, const ObjectPath &path) {
        serve(host);
        const std::size_t listsBefore = HostSim_LiveListCount();
        Response response = send(operation, path);
        EXPECT_EQ(HostSim_LiveListCount(), listsBefore) << "a platform list was not freed";
        EXPECT_EQ(HostSim_LiveListCount(), 0u);
        EXPECT_EQ(broker.liveObjectCount(), 0u) << "broker objects outlived the request";
        return response;
    }

    // The clean answer, then each call failed at positions 1, 2, ... until
    // a position is not reached, where the answer is the clean one again.
    void sweep(Operation operation, const ObjectPath &path) {
        SCOPED_TRACE(std::string(kOperationNames[int(operation)]) + " " + formatPath(path));
        json host = cleanHost();
        const Response clean = sendOn(host, operation, path);
        ASSERT_TRUE(clean.ok()) << clean.message.value_or("");
        {
            // Every request reads the boot bank afresh; one that cannot be
            // read keeps the record read last.
            const std::string bootBank = std::getenv(kBootBank) != nullptr ? std::getenv(kBootBank) : "";
            ::setenv(kBootBank, "/nonexistent/boot.cfg", 1);
            SCOPED_TRACE("boot bank unreadable");
            checkAnswer({Outcome::Unchanged}, operation, clean, sendOn(host, operation, path));
            ::setenv(kBootBank, bootBank.c_str(), 1);
        }
        for (const PlatformCall &call : platformCalls) {
            for (std::uint64_t nth = 1;; ++nth) {
                SCOPED_TRACE(std::string(call.name) + " failing at call " + std::to_string(nth));
                json rule = call.rule;
                rule["nth"] = nth;
                host["faults"] = json::array({rule});
                const Response got = sendOn(host, operation, path);
                if (HostSim_FaultMatchCount(0) < nth) {
                    checkAnswer({Outcome::Unchanged}, operation, clean, got);
                    break;
                }
                ++positionsReached;
                checkAnswer(documented(registration().providerName, call, operation), operation, clean, got);
                ASSERT_LT(nth, kRunawayPosition);
                if (HasFatalFailure()) return;
            }
        }
    }

    Broker broker{loadBrokerConfig({TVX_PROVIDER_DIR, TVX_HOST_PROVIDER_DIR},
                                   {TVX_PROVIDER_REG, TVX_HOST_PROVIDER_REG},
                                   {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF})};
    std::uint64_t positionsReached = 0;
};

TEST_P(FaultSweep, EveryFailedPlatformCallGetsItsDocumentedAnswer) {
    if (registration().instance) {
        sweep(Operation::EnumInstanceNames, classPath());
        sweep(Operation::EnumInstances, classPath());
        const Response names = sendOn(cleanHost(), Operation::EnumInstanceNames, classPath());
        // The last instance is reached after the most platform calls.
        if (!names.paths.empty()) sweep(Operation::GetInstance, names.paths.back());
    }
    if (registration().association) {
        serve(cleanHost());
        const std::vector<ObjectPath> starts =
            consistency::associationStarts(broker, GetParam(), classPath().nameSpace);
        EXPECT_FALSE(starts.empty()) << "no instance at either end takes part in " << GetParam();
        for (const ObjectPath &start : starts) {
            for (Operation operation : {Operation::Associators, Operation::AssociatorNames, Operation::References,
                                        Operation::ReferenceNames}) {
                sweep(operation, start);
            }
        }
    }
    RecordProperty("FaultPositionsReached", std::to_string(positionsReached));
}

std::vector<std::string> productClasses() {
    std::vector<std::string> classes;
    for (const ProviderRegistration &registration : readRegistrationFile(TVX_PROVIDER_REG)) {
        if (registration.instance || registration.association) classes.push_back(registration.className);
    }
    return classes;
}

INSTANTIATE_TEST_SUITE_P(Registered, FaultSweep, testing::ValuesIn(productClasses()),
                         [](const auto &test) { return test.param; });

}  // namespace

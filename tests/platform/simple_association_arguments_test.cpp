// What OMC::SimpleAssociationMI asks doReferences for each operation, and
// what reaches its own caller.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "OmcTestBroker.h"
#include "platform/OmcSimpleAssociationMI.h"

namespace {

constexpr const char *kNull = "(null)";

class RecordingAssociation : public OMC::SimpleAssociationMI {
public:
    RecordingAssociation(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), SimpleAssociationMI(mb, ctx) {}

    CmpiStatus doReferences(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &op,
                            const char *assocClass, const char *resultClass, const char *role,
                            const char *resultRole) override {
        seen.clear();
        for (const char *argument : {assocClass, resultClass, role, resultRole}) {
            seen.emplace_back(argument != nullptr ? argument : kNull);
        }
        if (answerWithPath) rslt.returnData(op);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    std::vector<std::string> seen;
    bool answerWithPath = false;
};

class CountingResult : public CmpiResult {
public:
    CountingResult() : CmpiResult(nullptr) {}
    void returnData(const CmpiInstance &) override { ++answers; }
    void returnData(const CmpiObjectPath &) override { ++answers; }
    void returnData(const CmpiData &) override { ++answers; }
    void returnDone() override { ++dones; }

    int answers = 0;
    int dones = 0;
};

class SimpleAssociationArguments : public testing::Test {
protected:
    tvxbroker::Broker broker{omctest::omcTestConfig()};
    CmpiContext ctx{broker.newContext("root/cimv2")};
    RecordingAssociation provider{CmpiBroker(broker.cmpiBroker()), ctx};
    CmpiObjectPath source{"root/cimv2", "Test_System"};
};

TEST_F(SimpleAssociationArguments, ReferenceOperationsPassTheirResultClassAsTheAssociationClass) {
    using Operation = std::function<CmpiStatus(CmpiResult &)>;
    struct Case {
        const char *operation;
        Operation call;
        std::vector<std::string> seen;
    };
    const Case cases[] = {
        {"associators",
         [&](CmpiResult &r) { return provider.associators(ctx, r, source, "A", "R", "role", "far", nullptr); },
         {"A", "R", "role", "far"}},
        {"associatorNames",
         [&](CmpiResult &r) { return provider.associatorNames(ctx, r, source, "A", "R", "role", "far"); },
         {"A", "R", "role", "far"}},
        {"references",
         [&](CmpiResult &r) { return provider.references(ctx, r, source, "A", "role", nullptr); },
         {"A", kNull, "role", kNull}},
        {"referenceNames",
         [&](CmpiResult &r) { return provider.referenceNames(ctx, r, source, "A", "role"); },
         {"A", kNull, "role", kNull}},
    };
    for (const Case &c : cases) {
        SCOPED_TRACE(c.operation);
        CountingResult result;
        EXPECT_EQ(c.call(result).rc(), CMPI_RC_OK);
        EXPECT_EQ(provider.seen, c.seen);
        EXPECT_EQ(result.answers, 0);
        EXPECT_EQ(result.dones, 1);  // the provider's own end of results is not passed on
    }
}

TEST_F(SimpleAssociationArguments, APathAnsweredAsAnAssociationFailsTheRequest) {
    provider.answerWithPath = true;
    CountingResult result;
    try {
        provider.referenceNames(ctx, result, source, nullptr, nullptr);
        ADD_FAILURE() << "the path was accepted";
    } catch (const CmpiStatus &status) {
        EXPECT_EQ(status.rc(), CMPI_RC_ERR_FAILED);
    }
    EXPECT_EQ(result.answers + result.dones, 0);
}

}  // namespace

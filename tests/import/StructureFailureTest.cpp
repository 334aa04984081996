#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <stdexcept>

namespace VizBridgeTarvex {
namespace {

/// Product: A.1 of sub-assembly 20 (X.1 of part 30, B.1 of sub-assembly 40 (Y.1 of part 50),
/// Z.1 of part 60), then R.1 of part 70.
struct Tree {
    TarvexModel model;
    unsigned int yInstance = 0;

    Tree() {
        model.SetProductName(u"Prod");
        model.AddAssembly(20, u"A");
        model.AddPart(30, u"X");
        model.AddAssembly(40, u"B");
        model.AddPart(50, u"Y");
        model.AddPart(60, u"Z");
        model.AddPart(70, u"R");
        model.AddRootInstance(20, u"A.1");
        model.AddInstance(20, 30, u"X.1");
        model.AddInstance(20, 40, u"B.1");
        yInstance = model.AddInstance(40, 50, u"Y.1").instanceId;
        model.AddInstance(20, 60, u"Z.1");
        model.AddRootInstance(70, u"R.1");
    }
    void fail(char const* operation, std::optional<unsigned int> subject, TarvexFaultKind kind,
              std::string what = "boom") {
        TarvexFault fault;
        fault.operation = operation;
        fault.subject = subject;
        fault.kind = kind;
        fault.what = std::move(what);
        model.Faults().Add(fault);
    }
};

/// The instance names in the tree, depth first.
std::vector<WString> names(VizProductStructure const& s) {
    std::vector<WString> out;
    std::vector<VizPSEntry const*> stack(s.GetChildren().rbegin(), s.GetChildren().rend());
    while (!stack.empty()) {
        VizPSEntry const* entry = stack.back();
        stack.pop_back();
        out.push_back(entry->GetInstanceName());
        stack.insert(stack.end(), entry->GetChildren().rbegin(), entry->GetChildren().rend());
    }
    return out;
}

struct FailureCase {
    char const* name;
    char const* operation;
    unsigned int subject; ///< 0: Y.1's instance
    TarvexFaultKind kind;
    WString stored;
    WString debug;
    std::vector<WString> tree;
};

class StructureFailure : public testing::TestWithParam<FailureCase> {};

TEST_P(StructureFailure, IsRecordedAndSkipsOnlyTheFailingSubTree) {
    FailureCase const& c = GetParam();
    KolbaVizCore::ScopedAllowThrow const noThrow(false);
    Tree tree;
    tree.fail(c.operation, c.subject ? c.subject : tree.yInstance, c.kind);
    DebugCapture debug;

    auto const s = buildStructure(tree.model);

    EXPECT_EQ(s->GetErrorMessages(), std::vector<WString>{c.stored});
    EXPECT_EQ(debug.texts(), std::vector<WString>{c.debug});
    EXPECT_EQ(names(*s), c.tree);
}

TarvexFaultKind const kStd = TarvexFaultKind::StdException;
TarvexFaultKind const kOther = TarvexFaultKind::NonStdException;
INSTANTIATE_TEST_SUITE_P(
    Cases, StructureFailure,
    testing::Values(
        FailureCase{"beforeTheIdIsRead",
                    "TarvexInputPSReference::IsPart",
                    30,
                    kStd,
                    u"Error on Product Structure Instance (RefID 0) : boom",
                    u"Error on RefID 0: boom",
                    {u"A.1", u"B.1", u"Y.1", u"Z.1", u"R.1"}},
        FailureCase{"afterTheIdIsRead",
                    "TarvexInputPSReference::GetStorageName",
                    30,
                    kStd,
                    u"Error on Product Structure Instance (RefID 30) : boom",
                    u"Error on RefID 30: boom",
                    {u"A.1", u"B.1", u"Y.1", u"Z.1", u"R.1"}},
        FailureCase{"notAStdException",
                    "TarvexInputPSReference::GetStorageName",
                    30,
                    kOther,
                    u"Product Structure Part Import (RefID 30) Error : Unknown Exception",
                    u"Error on RefID 30: Unknown exception while importing Product Structure",
                    {u"A.1", u"B.1", u"Y.1", u"Z.1", u"R.1"}},
        FailureCase{"twoLevelsDown",
                    "TarvexInputPSInstance::GetHidden",
                    0,
                    kStd,
                    u"Error on Product Structure Instance (RefID 50) : boom",
                    u"Error on RefID 50: boom",
                    {u"A.1", u"X.1", u"B.1", u"Z.1", u"R.1"}},
        FailureCase{"instanceOfASubAssembly",
                    "TarvexInputPSReference::GetInstance",
                    40,
                    kStd,
                    u"Error on Product Structure Instance (RefID 0) : boom",
                    u"Error on RefID 0: boom",
                    {u"A.1", u"X.1", u"B.1", u"Z.1", u"R.1"}},
        FailureCase{"aRootReference",
                    "TarvexInputPSReference::GetInstancesCount",
                    20,
                    kStd,
                    u"Error on Product Structure Instance (RefID 20) : boom",
                    u"Error on RefID 20: boom",
                    {u"R.1"}},
        FailureCase{"aRootOfAnotherKind",
                    "TarvexInputPSReference::GetInstancesCount",
                    20,
                    kOther,
                    u"Product Structure Part Import (RefID 20) Error : Unknown Exception",
                    u"Error on RefID 20: Unknown exception while importing Product Structure",
                    {u"R.1"}}),
    [](testing::TestParamInfo<FailureCase> const& info) { return info.param.name; });

TEST(StructureFailure, FailuresUnderOneKeyAreAppended) {
    KolbaVizCore::ScopedAllowThrow const noThrow(false);
    Tree tree;
    TarvexFault fault;
    fault.operation = "TarvexInputPSReference::IsPart"; // before any id is read: key 0
    fault.subject = 30;
    fault.what = "one";
    tree.model.Faults().Add(fault);
    fault.subject = 60;
    fault.what = "two";
    tree.model.Faults().Add(fault);
    auto const s = buildStructure(tree.model);
    EXPECT_EQ(s->GetErrorMessages(),
              std::vector<WString>{u"Error on Product Structure Instance (RefID 0) : one"
                                   u"Error on Product Structure Instance (RefID 0) : two"});
}

TEST(StructureFailure, WithTheSwitchOnEachLevelRecordsAndThrowsOn) {
    struct Case {
        TarvexFaultKind kind;
        WString stored50;
        std::string what;
    };
    Case const cases[] = {
        {kStd, u"Error on Product Structure Instance (RefID 50) : boom", "boom"},
        {kOther, u"Product Structure Part Import (RefID 50) Error : Unknown Exception",
         "Product Structure Part Import (RefID 50) Error : Unknown Exception"},
    };
    for (Case const& c : cases) {
        KolbaVizCore::ScopedAllowThrow const allow(true);
        Tree tree;
        tree.fail("TarvexInputPSInstance::GetHidden", tree.yInstance, c.kind);
        DebugCapture debug;
        std::unique_ptr<VizProductStructure> s;
        try {
            buildStructure(tree.model, s);
            ADD_FAILURE() << "the exception must reach the host";
        } catch (std::exception const& e) {
            EXPECT_EQ(e.what(), c.what);
        }
        ASSERT_NE(s, nullptr) << "the host owns what was built";
        WString const stored40 =
            u"Error on Product Structure Instance (RefID 40) : " + VizPort::Widen(c.what);
        EXPECT_EQ(s->GetErrorMessages(), (std::vector<WString>{stored40, c.stored50}));
        EXPECT_EQ(debug.texts().size(), 2u);
        EXPECT_EQ(names(*s), (std::vector<WString>{u"A.1", u"X.1", u"B.1"}))
            << "building stops at the failure";
    }
}

TEST(StructureFailure, WithTheSwitchOnARootFailureReachesTheHostUnchanged) {
    KolbaVizCore::ScopedAllowThrow const allow(true);
    Tree tree;
    tree.fail("TarvexInputPSReference::GetUniqueID", 70, TarvexFaultKind::NonStdException);
    std::unique_ptr<VizProductStructure> s;
    EXPECT_THROW(buildStructure(tree.model, s), TarvexForeignError);
    ASSERT_NE(s, nullptr);
    EXPECT_TRUE(s->GetErrorMessages().empty());
    EXPECT_EQ(names(*s).size(), 5u);
}

TEST(StructureFailure, ProductLevelReadsReachTheCaller) {
    KolbaVizCore::ScopedAllowThrow const noThrow(false);
    Tree tree;
    tree.fail("TarvexDocumentInformation::GetAuthor", std::nullopt, kStd, "no author");
    std::unique_ptr<VizProductStructure> s;
    try {
        buildStructure(tree.model, s);
        ADD_FAILURE() << "expected the exception";
    } catch (std::runtime_error const& e) {
        EXPECT_STREQ(e.what(), "no author");
    }
    EXPECT_NE(s, nullptr) << "made before the document was read; the caller frees it";
}

} // namespace
} // namespace VizBridgeTarvex

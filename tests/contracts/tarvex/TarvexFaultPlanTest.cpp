#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexFaultPlan.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <functional>
#include <optional>
#include <ostream>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace {

TarvexFault FaultOn(std::string operation, std::optional<unsigned int> subject = std::nullopt) {
    TarvexFault fault;
    fault.operation = std::move(operation);
    fault.subject = subject;
    return fault;
}

/// One character per call: 'X' for a call that threw, '.' for one that passed.
std::string Pattern(TarvexFaultPlan const& plan, char const* operation, int calls) {
    std::string pattern;
    for (int call = 0; call < calls; ++call) {
        try {
            plan.Check(operation, 0);
            pattern += '.';
        } catch (std::runtime_error const&) {
            pattern += 'X';
        }
    }
    return pattern;
}

TEST(TarvexFaultPlanTest, AnEmptyPlanNeverThrows) {
    TarvexFaultPlan const plan;
    EXPECT_NO_THROW(plan.Check("TarvexInputPSReference::GetUniqueID", 3));
    EXPECT_EQ(plan.GetFiredCount(), 0);
}

TEST(TarvexFaultPlanTest, MatchesByOperationAndThrowsTheChosenText) {
    TarvexFaultPlan plan;
    TarvexFault fault = FaultOn("TarvexInputPSReference::GetUniqueID");
    fault.what = "disk on fire";
    plan.Add(fault);

    EXPECT_NO_THROW(plan.Check("TarvexInputPSReference::IsPart", 3));
    EXPECT_NO_THROW(plan.Check("TarvexInputPSReference::GetUniqueIDs", 3));
    try {
        plan.Check("TarvexInputPSReference::GetUniqueID", 3);
        ADD_FAILURE() << "no fault thrown";
    } catch (std::runtime_error const& error) {
        EXPECT_STREQ(error.what(), "disk on fire");
    }
}

TEST(TarvexFaultPlanTest, ASubjectLimitsTheFaultToOneObject) {
    TarvexFaultPlan plan;
    plan.Add(FaultOn("TarvexInputPSInstance::GetHidden", 5));
    EXPECT_NO_THROW(plan.Check("TarvexInputPSInstance::GetHidden", 4));
    EXPECT_NO_THROW(plan.Check("TarvexInputPSInstance::GetHidden", 0));
    EXPECT_THROW(plan.Check("TarvexInputPSInstance::GetHidden", 5), std::runtime_error);
}

TEST(TarvexFaultPlanTest, AForeignFaultIsNoStdException) {
    TarvexFaultPlan plan;
    TarvexFault fault = FaultOn("TarvexPartDocument::GetName");
    fault.kind = TarvexFaultKind::NonStdException;
    plan.Add(fault);
    bool caughtForeign = false;
    try {
        try {
            plan.Check("TarvexPartDocument::GetName", 0);
        } catch (std::exception const&) {
            ADD_FAILURE() << "caught as a std::exception";
        }
    } catch (TarvexForeignError const&) {
        caughtForeign = true;
    }
    EXPECT_TRUE(caughtForeign);
    EXPECT_EQ(plan.GetFiredCount(), 1);
}

struct SkipTimesCase {
    int skip;
    int times;
    char const* pattern;
};

void PrintTo(SkipTimesCase const& c, std::ostream* os) {
    *os << "skip " << c.skip << ", times " << c.times;
}

class TarvexFaultSkipTimesTest : public ::testing::TestWithParam<SkipTimesCase> {};

TEST_P(TarvexFaultSkipTimesTest, FiresAfterSkipForTimes) {
    TarvexFaultPlan plan;
    TarvexFault fault = FaultOn("Op");
    fault.skip = GetParam().skip;
    fault.times = GetParam().times;
    plan.Add(fault);
    std::string const expected = GetParam().pattern;
    EXPECT_EQ(Pattern(plan, "Op", static_cast<int>(expected.size())), expected);
    EXPECT_EQ(plan.GetFiredCount(),
              static_cast<int>(std::count(expected.begin(), expected.end(), 'X')));
}

INSTANTIATE_TEST_SUITE_P(
    Cases, TarvexFaultSkipTimesTest,
    ::testing::Values(SkipTimesCase{0, -1, "XXXXX"}, SkipTimesCase{2, -1, "..XXX"},
                      SkipTimesCase{0, 1, "X...."}, SkipTimesCase{1, 2, ".XX.."},
                      SkipTimesCase{0, 0, "....."}, SkipTimesCase{4, 1, "....X."},
                      SkipTimesCase{-3, 2, "XX..."}));

TEST(TarvexFaultPlanTest, EveryMatchingFaultCountsTheCallAndTheFirstDueThrows) {
    TarvexFaultPlan plan;
    TarvexFault first = FaultOn("Op");
    first.times = 1;
    first.what = "first";
    TarvexFault second = FaultOn("Op");
    second.skip = 2;
    second.times = 1;
    second.what = "second";
    plan.Add(first);
    plan.Add(second);

    std::vector<std::string> outcomes;
    for (int call = 0; call < 4; ++call) {
        try {
            plan.Check("Op", 0);
            outcomes.emplace_back("-");
        } catch (std::runtime_error const& error) {
            outcomes.emplace_back(error.what());
        }
    }
    // The second fault's skip counts the call on which the first one fired.
    EXPECT_EQ(outcomes, (std::vector<std::string>{"first", "-", "second", "-"}));
    EXPECT_EQ(plan.GetFiredCount(), 2);
}

TEST(TarvexFaultPlanTest, ClearRemovesTheFaultsAndTheCount) {
    TarvexFaultPlan plan;
    plan.Add(FaultOn("Op"));
    EXPECT_EQ(Pattern(plan, "Op", 2), "XX");
    EXPECT_EQ(plan.GetFiredCount(), 2);
    plan.Clear();
    EXPECT_EQ(plan.GetFiredCount(), 0);
    EXPECT_EQ(Pattern(plan, "Op", 2), "..");
}

TEST(TarvexFaultPlanTest, FiresExactlyTheGivenTimesAcrossThreads) {
    TarvexFaultPlan plan;
    TarvexFault fault = FaultOn("Op");
    fault.skip = 50;
    fault.times = 300;
    plan.Add(fault);

    std::atomic<int> thrown{0};
    std::vector<std::thread> threads;
    for (int thread = 0; thread < 4; ++thread) {
        threads.emplace_back([&plan, &thrown] {
            for (int call = 0; call < 500; ++call) {
                try {
                    plan.Check("Op", 0);
                } catch (std::runtime_error const&) {
                    ++thrown;
                }
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(thrown.load(), 300);
    EXPECT_EQ(plan.GetFiredCount(), 300);
}

// Every operation of the value objects asks the model's plan, under its exact name and with
// its object as the subject.

/// Value objects onto a small model, taken before any fault is planned. The root instance
/// (authoring id 1) places the assembly 10, which holds the part 20 (instance id 2).
struct Handles {
    TarvexModel model;
    TarvexInputProductStructure structure;
    TarvexInputPSInstance instance;
    TarvexInputPSReference reference;
    TarvexPartDocument partDocument;
    TarvexDocument document;
    TarvexDocumentInformation information;
    TarvexPSImportResult result;
    TarvexInputPSMissingFileIter missing;

    Handles() {
        model.AddAssembly(10, u"A", u"a.asm");
        model.AddPart(20, u"P", u"p.prt");
        model.AddRootInstance(10, u"root");
        model.AddInstance(10, 20, u"child");
        model.Document().author = u"someone";
        model.AddMissingFile(u"gone.prt");
        structure = model.GetInputProductStructure();
        instance = structure.GetRootInstance(0);
        reference = instance.GetReference();
        partDocument = reference.GetInstance(0).GetReference().GetDocument();
        document = model.GetDocument();
        information = document.GetInformation();
        result = model.GetImportResult();
        missing = result.GetMissingFileIterator();
    }
};

struct OperationCase {
    char const* operation;
    unsigned int subject;
    std::function<void(Handles&)> call;
};

void PrintTo(OperationCase const& c, std::ostream* os) {
    *os << c.operation;
}

std::string CaseName(::testing::TestParamInfo<OperationCase> const& info) {
    std::string name = info.param.operation;
    name.replace(name.find("::"), 2, "_");
    return name;
}

class TarvexOperationFaultTest : public ::testing::TestWithParam<OperationCase> {};

TEST_P(TarvexOperationFaultTest, ThrowsWhenPlanned) {
    Handles handles;
    TarvexFault fault = FaultOn(GetParam().operation, GetParam().subject);
    fault.what = GetParam().operation;
    handles.model.Faults().Add(fault);
    try {
        GetParam().call(handles);
        ADD_FAILURE() << "no fault thrown";
    } catch (std::runtime_error const& error) {
        EXPECT_STREQ(error.what(), GetParam().operation);
    }
    EXPECT_EQ(handles.model.Faults().GetFiredCount(), 1);
}

TEST_P(TarvexOperationFaultTest, PassesForAnotherSubject) {
    Handles handles;
    handles.model.Faults().Add(FaultOn(GetParam().operation, GetParam().subject + 1));
    EXPECT_NO_THROW(GetParam().call(handles));
}

void ReadText(bool (TarvexDocumentInformation::*getter)(TarvexWString&) const, Handles& h) {
    TarvexWString value;
    (h.information.*getter)(value);
}

INSTANTIATE_TEST_SUITE_P(
    AllOperations, TarvexOperationFaultTest,
    ::testing::Values(
        OperationCase{"TarvexInputProductStructure::GetProductName", 0,
                      [](Handles& h) { h.structure.GetProductName(); }},
        OperationCase{"TarvexInputProductStructure::GetUniqueReferencesCount", 0,
                      [](Handles& h) { h.structure.GetUniqueReferencesCount(); }},
        OperationCase{"TarvexInputProductStructure::GetRootInstancesCount", 0,
                      [](Handles& h) { h.structure.GetRootInstancesCount(); }},
        OperationCase{"TarvexInputProductStructure::GetRootInstance", 0,
                      [](Handles& h) { h.structure.GetRootInstance(0); }},
        OperationCase{"TarvexInputProductStructure::GetUnits", 0,
                      [](Handles& h) { h.structure.GetUnits(); }},
        OperationCase{"TarvexInputPSInstance::GetReference", 1,
                      [](Handles& h) { h.instance.GetReference(); }},
        OperationCase{"TarvexInputPSInstance::GetInstanceName", 1,
                      [](Handles& h) { h.instance.GetInstanceName(); }},
        OperationCase{"TarvexInputPSInstance::GetInstancePositionMatrix", 1,
                      [](Handles& h) {
                          double rotation[3][3];
                          double translation[3];
                          h.instance.GetInstancePositionMatrix(rotation, translation);
                      }},
        OperationCase{"TarvexInputPSInstance::GetHidden", 1,
                      [](Handles& h) {
                          bool value = false;
                          h.instance.GetHidden(value);
                      }},
        OperationCase{"TarvexInputPSInstance::GetSuppressed", 1,
                      [](Handles& h) {
                          bool value = false;
                          h.instance.GetSuppressed(value);
                      }},
        OperationCase{"TarvexInputPSInstance::GetRGBColor", 1,
                      [](Handles& h) {
                          unsigned short r = 0, g = 0, b = 0;
                          h.instance.GetRGBColor(r, g, b);
                      }},
        OperationCase{"TarvexInputPSInstance::GetAlphaColor", 1,
                      [](Handles& h) {
                          unsigned short a = 0;
                          h.instance.GetAlphaColor(a);
                      }},
        OperationCase{"TarvexInputPSReference::GetReferenceName", 10,
                      [](Handles& h) { h.reference.GetReferenceName(); }},
        OperationCase{"TarvexInputPSReference::GetStorageName", 10,
                      [](Handles& h) { h.reference.GetStorageName(); }},
        OperationCase{"TarvexInputPSReference::IsPart", 10,
                      [](Handles& h) { h.reference.IsPart(); }},
        OperationCase{"TarvexInputPSReference::GetUniqueID", 10,
                      [](Handles& h) { h.reference.GetUniqueID(); }},
        OperationCase{"TarvexInputPSReference::GetInstancesCount", 10,
                      [](Handles& h) { h.reference.GetInstancesCount(); }},
        OperationCase{"TarvexInputPSReference::GetInstance", 10,
                      [](Handles& h) { h.reference.GetInstance(0); }},
        OperationCase{"TarvexInputPSReference::GetDocument", 10,
                      [](Handles& h) { h.reference.GetDocument(); }},
        OperationCase{"TarvexPartDocument::GetName", 0,
                      [](Handles& h) { h.partDocument.GetName(); }},
        OperationCase{"TarvexDocument::GetInformation", 0,
                      [](Handles& h) { h.document.GetInformation(); }},
        OperationCase{"TarvexDocumentInformation::GetFileName", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetFileName, h); }},
        OperationCase{"TarvexDocumentInformation::GetAuthor", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetAuthor, h); }},
        OperationCase{"TarvexDocumentInformation::GetOrganization", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetOrganization, h); }},
        OperationCase{"TarvexDocumentInformation::GetSourceSystem", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetSourceSystem, h); }},
        OperationCase{"TarvexDocumentInformation::GetVersion", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetVersion, h); }},
        OperationCase{"TarvexDocumentInformation::GetUnit", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetUnit, h); }},
        OperationCase{"TarvexDocumentInformation::GetComment", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetComment, h); }},
        OperationCase{"TarvexDocumentInformation::GetFormatType", 0,
                      [](Handles& h) { ReadText(&TarvexDocumentInformation::GetFormatType, h); }},
        OperationCase{"TarvexPSImportResult::GetMissingFileIterator", 0,
                      [](Handles& h) { h.result.GetMissingFileIterator(); }},
        OperationCase{"TarvexInputPSMissingFileIter::GetCount", 0,
                      [](Handles& h) { h.missing.GetCount(); }},
        OperationCase{"TarvexInputPSMissingFileIter::Next", 0,
                      [](Handles& h) { h.missing.Next(); }},
        OperationCase{"TarvexInputPSMissingFileIter::Current", 0,
                      [](Handles& h) { h.missing.Current(); }}),
    CaseName);

TEST(TarvexFaultPlanTest, InstanceFaultsAreLimitedByAuthoringId) {
    Handles handles;
    handles.model.Faults().Add(FaultOn("TarvexInputPSInstance::GetInstanceName", 2));
    EXPECT_NO_THROW(handles.instance.GetInstanceName());
    TarvexInputPSInstance const child = handles.reference.GetInstance(0);
    EXPECT_THROW(child.GetInstanceName(), std::runtime_error);
}

TEST(TarvexFaultPlanTest, AFaultedIteratorStepResumesWhereItStopped) {
    Handles handles;
    TarvexFault fault = FaultOn("TarvexInputPSMissingFileIter::Next");
    fault.times = 1;
    handles.model.Faults().Add(fault);
    EXPECT_THROW(handles.missing.Next(), std::runtime_error);
    ASSERT_TRUE(handles.missing.Next());
    EXPECT_EQ(handles.missing.Current().ToWString(), u"gone.prt");
    EXPECT_FALSE(handles.missing.Next());
}

} // namespace

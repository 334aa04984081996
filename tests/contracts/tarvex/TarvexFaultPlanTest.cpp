#include "support/TarvexTestProduct.h"
#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexFaultPlan.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <functional>
#include <string>
#include <thread>
#include <tuple>
#include <utility>
#include <vector>

namespace {

/// What each of `calls` checks of "Op" gave, one after another: "-" for a check that passed,
/// the text of the fault that one threw.
std::string Outcomes(TarvexFaultPlan const& plan, int calls) {
    std::string outcomes;
    for (int call = 0; call < calls; ++call) {
        outcomes += Outcome([&plan] { plan.Check("Op", 0); }) + " ";
    }
    return outcomes;
}

TEST(TarvexFaultPlanTest, AFaultFiresAfterItsSkipForItsTimes) {
    std::tuple<int, int, std::string, int> const cases[] = {
        {0, -1, "Op Op Op ", 3}, {2, -1, "- - Op Op ", 2}, {0, 1, "Op - - ", 1},
        {1, 2, "- Op Op - ", 2}, {0, 0, "- - ", 0},        {4, 1, "- - - - Op - ", 1},
        {-3, 2, "Op Op - ", 2}};
    for (auto const& [skip, times, outcomes, fired] : cases) {
        TarvexFaultPlan plan;
        TarvexFault fault = FaultOn("Op");
        fault.skip = skip;
        fault.times = times;
        plan.Add(fault);
        EXPECT_EQ(Outcomes(plan, int(std::count(outcomes.begin(), outcomes.end(), ' '))), outcomes);
        EXPECT_EQ(plan.GetFiredCount(), fired);
    }
}

TEST(TarvexFaultPlanTest, MatchesTheWholeOperationNameAndTheSubjectAndTheFirstDueThrowsItsKind) {
    TarvexFaultPlan plan;
    EXPECT_EQ(Outcomes(plan, 2), "- - ") << "an empty plan";
    plan.Add(FaultOn("A::Get", 5));
    TarvexFault foreign = FaultOn("A::Foreign");
    foreign.kind = TarvexFaultKind::NonStdException;
    plan.Add(foreign);
    std::pair<char const*, unsigned int> const calls[] = {
        {"A::Get", 4}, {"A::GetX", 5}, {"A::Ge", 5}, {"A::Get", 5}, {"A::Foreign", 9}};
    std::string outcomes;
    for (auto const& [operation, subject] : calls) {
        outcomes += Outcome([&] { plan.Check(operation, subject); }) + " ";
    }
    EXPECT_EQ(outcomes, "- - - A::Get foreign ");
    EXPECT_EQ(plan.GetFiredCount(), 2);
    plan.Clear();
    EXPECT_EQ(plan.GetFiredCount(), 0);
    EXPECT_EQ(Outcome([&] { plan.Check("A::Foreign", 0); }), "-");

    // Every matching fault counts the call against its skip, also one on which another fires;
    // when several are due, the first one added throws.
    TarvexFault first = FaultOn("Op");
    first.times = 2;
    first.what = "first";
    TarvexFault second = first;
    second.skip = 1;
    second.times = 1;
    second.what = "second";
    plan.Add(first);
    plan.Add(second);
    EXPECT_EQ(Outcomes(plan, 4), "first first second - ");
}

TEST(TarvexFaultPlanTest, FiresExactlyItsTimesAcrossThreads) {
    TarvexFaultPlan plan;
    TarvexFault fault = FaultOn("Op");
    fault.skip = 50;
    fault.times = 300;
    plan.Add(fault);
    std::atomic<long> thrown{0};
    auto const call = [&] {
        for (int i = 0; i < 400; ++i)
            thrown += Outcome([&plan] { plan.Check("Op", 0); }) == "Op";
    };
    std::thread first(call), second(call);
    first.join();
    second.join();
    EXPECT_EQ(thrown, 300);
    EXPECT_EQ(plan.GetFiredCount(), 300);
}

// A value object asks its model's plan under its exact operation name, with its subject: a
// reference's unique id, an instance's authoring id, the imported reference's unique id for
// visualisation data, and 0 for the others. The faults of the spooler, the missing files, the
// conversion and the import are tried beside what they interrupt.
TEST(TarvexFaultPlanTest, ValueObjectsAskTheirModelsPlanForTheirOperationAndSubject) {
    TarvexModel model = MakeTestProduct();
    model.FindReference(20)->visu.nodes.resize(1);
    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    TarvexInputPSReference const top = structure.GetRootInstance(0).GetReference();
    TarvexInputPSInstance const child = top.GetInstance(0);
    TarvexPartDocument const part = structure.GetReferenceFromId(20).GetDocument();
    TarvexEntity const entity = model.MakeEntity({1, 2}, 10);
    TarvexVisuData const data = TarvexVisualizationImporter().Import(part).GetVisualizationData();
    TarvexVisuNodeIter nodes = data.GetNodeIterator();
    std::tuple<char const*, unsigned int, std::function<void()>> const cases[] = {
        {"TarvexInputPSReference::GetUniqueID", 1, [&] { top.GetUniqueID(); }},
        {"TarvexInputPSInstance::GetInstanceName", 2, [&] { child.GetInstanceName(); }},
        {"TarvexPartDocument::GetName", 0, [&] { part.GetName(); }},
        {"TarvexEntity::GetEntityId", 0, [&] { entity.GetEntityId(); }},
        {"TarvexVisualizationImporter::Import", 20,
         [&] { TarvexVisualizationImporter().Import(part); }},
        {"TarvexVisuNodeIter::Next", 20, [&] { nodes.Next(); }},
    };
    for (auto const& [operation, subject, call] : cases) {
        SCOPED_TRACE(operation);
        model.Faults().Clear();
        model.Faults().Add(FaultOn(operation, subject + 1));
        EXPECT_EQ(Outcome(call), "-") << "planned for another subject";
        model.Faults().Add(FaultOn(operation, subject));
        EXPECT_EQ(Outcome(call), operation);
        EXPECT_EQ(model.Faults().GetFiredCount(), 1);
    }
}

} // namespace

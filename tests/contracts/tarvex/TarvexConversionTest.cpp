#include "support/TarvexTestProduct.h"

#include <VizBridge/contracts/tarvex/TarvexConvertedPart.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcessSpooler.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <set>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>
#include <tuple>
#include <utility>
#include <vector>

namespace {

using Part = std::shared_ptr<TarvexConvertedPart const>;

/// The document of reference `id`, reached as a host reaches it.
TarvexPartDocument DocumentOf(TarvexModel const& model, unsigned int id) {
    return model.GetInputProductStructure().GetReferenceFromId(static_cast<int>(id)).GetDocument();
}

/// Per face its triangles' corners and, after the bar, their normals; per edge its points;
/// then the box.
std::string Describe(TarvexConvertedPart const& part) {
    std::ostringstream out;
    auto const put = [&out](std::vector<float> const& values, char const* end) {
        for (float const value : values)
            out << ' ' << value;
        out << end;
    };
    for (TarvexConvertedPart::Face const& face : part.faces) {
        out << "face " << face.entityId << ':';
        put(face.positions, " |");
        put(face.normals, "\n");
    }
    for (TarvexConvertedPart::Edge const& edge : part.edges) {
        out << "edge " << edge.entityId << ':';
        put(edge.points, "\n");
    }
    out << "box";
    if (!part.empty)
        for (double const bound :
             {part.low[0], part.low[1], part.low[2], part.high[0], part.high[1], part.high[2]})
            out << ' ' << bound;
    return out.str();
}

TEST(TarvexConversionTest, MakesATriangleSoupWithAUnitNormalPerTriangleAndABox) {
    std::pair<TarvexAuthoredPartGeometry, char const*> const cases[] = {
        // A square facing up, a slanted triangle and an edge.
        {{{{7, {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0}, {0, 1, 2, 0, 2, 3}},
           {8, {0, 0, 0, 2, 0, 0, 0, 1, 1}, {0, 1, 2}}},
          {{9, {0, 0, 0, 1, 0, 0}}}},
         "face 7: 0 0 0 1 0 0 1 1 0 0 0 0 1 1 0 0 1 0 | 0 0 1 0 0 1\n"
         "face 8: 0 0 0 2 0 0 0 1 1 | 0 -0.707107 0.707107\n"
         "edge 9: 0 0 0 1 0 0\nbox 0 0 0 2 1 1"},
        // Triangles naming no vertex and half a triangle are dropped; no area, no normal.
        {{{{1,
            {0, 0, 0, 1, 0, 0, 0, 1, 0},
            {0, 1, 3, 0, 1, 2, 4000000000u, 0, 1, 2, 1, 0, 0, 0, 1, 0, 1}}},
          {}},
         "face 1: 0 0 0 1 0 0 0 1 0 0 1 0 1 0 0 0 0 0 0 0 0 0 0 0 1 0 0 | 0 0 1 0 0 -1 0 0 0\n"
         "box 0 0 0 1 1 0"},
        // The box holds every vertex and edge point, but no lone coordinate.
        {{{{1, {0, 0, 0, 1, 0, 0, 0, 1, 0, -5, 9, 0, 100}, {0, 1, 2}}, {2, {0, 0, -3}, {}}},
          {{3, {4, -1, 2, 0, 0, 6}}}},
         "face 1: 0 0 0 1 0 0 0 1 0 | 0 0 1\nface 2: |\nedge 3: 4 -1 2 0 0 6\nbox -5 -1 -3 4 9 6"},
        // No point at all, and nothing.
        {{{{1, {}, {0, 1, 2}}}, {{2, {1, 2}}}}, "face 1: |\nedge 2: 1 2\nbox"},
        {{}, "box"},
    };
    for (auto const& [geometry, expected] : cases) {
        TarvexModel model;
        model.AddPart(20, u"Part").geometry = geometry;
        Part const converted = DocumentOf(model, 20).GetConvertedPart();
        ASSERT_NE(converted, nullptr) << expected;
        EXPECT_EQ(Describe(*converted), expected);
    }
}

TEST(TarvexConversionTest, ConvertsEachPartOnceAfterAnyPlannedFaultAndKeepsResultsAndFailures) {
    TarvexModel model = MakeTestProduct();
    TarvexFault fault = FaultOn("TarvexPartDocument::GetConvertedPart");
    fault.times = 1;
    model.Faults().Add(fault);
    EXPECT_EQ(Outcome([&] { DocumentOf(model, 10).GetConvertedPart(); }), fault.operation);
    EXPECT_EQ(model.GetConversionCount(10), 0);
    Part const first = DocumentOf(model, 10).GetConvertedPart();
    ASSERT_NE(first, nullptr);
    model.FindReference(10)->geometry.faces.clear();
    EXPECT_EQ(DocumentOf(model, 10).GetConvertedPart(), first) << "kept: later authoring is unseen";
    EXPECT_EQ(model.GetConversionCount(10), 1);
    EXPECT_EQ(model.GetConversionThread(10), std::this_thread::get_id());

    model.FindReference(30)->geometry.conversionFails = true;
    EXPECT_EQ(DocumentOf(model, 30).GetConvertedPart(), nullptr);
    model.FindReference(30)->geometry.conversionFails = false;
    EXPECT_EQ(DocumentOf(model, 30).GetConvertedPart(), nullptr) << "a failure is kept too";
    EXPECT_EQ(model.GetConversionCount(30), 1);

    // Only parts of a model convert.
    EXPECT_EQ(DocumentOf(model, 1).GetConvertedPart(), nullptr);
    EXPECT_EQ(TarvexPartDocument(nullptr, 20).GetConvertedPart(), nullptr);
}

/// Polls the spooler as a host does until it completes, and gives the ids it delivered, a
/// failed conversion marked with "!", in order up to `anyOrderFrom` and sorted after it. A
/// spooler that does not complete within a minute fails the test instead of hanging it.
std::string Drain(TarvexMultiProcessSpooler& spooler, std::size_t anyOrderFrom = 0) {
    std::vector<std::string> ids;
    auto const deadline = std::chrono::steady_clock::now() + std::chrono::minutes(1);
    unsigned int id = 0;
    while (!spooler.IsComplete() && std::chrono::steady_clock::now() < deadline) {
        if (spooler.HasDataAvailableFor(id)) {
            bool const failed = spooler.GetActiveRepresentation() == TarvexRep_None;
            ids.push_back(std::to_string(id) + (failed ? "!" : ""));
        } else {
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
    }
    EXPECT_TRUE(spooler.IsComplete());
    EXPECT_FALSE(spooler.HasDataAvailableFor(id)) << "nothing after completion";
    std::sort(ids.begin() + std::min(anyOrderFrom, ids.size()), ids.end());
    std::string text;
    for (std::string const& delivered : ids) {
        text += (text.empty() ? "" : " ") + delivered;
    }
    return text;
}

// Each unique part is delivered once, when it is converted and its turn has come, converted
// on no more worker threads than allowed: 0 to use stands for every physical processor, and
// there are never more workers than the 4 parts.
TEST(TarvexSpoolerTest, ConvertsOnWorkerThreadsAndDeliversEachPartOnceInTurn) {
    using Model = TarvexModel&;
    auto const part = [](Model m, unsigned int id) -> auto& {
        return m.FindReference(id)->geometry;
    };
    // To use, physical processors, workers at most, deliveries, from where they may come in
    // any order, and how the model is prepared.
    std::tuple<int, std::optional<int>, std::size_t, std::string, std::size_t,
               std::function<void(Model)>> const cases[] = {
        // One worker follows a depth-first walk, but what finished first comes first.
        {1, 8, 1, "10 20 30 40", 4, [](Model) {}},
        {0, 1, 1, "40 10 20 30", 4, [](Model m) { DocumentOf(m, 40).GetConvertedPart(); }},
        // The model's order first, without unknown ids, repeats or sub-assemblies: 40 is slow,
        // and 30 waits for it although it finishes earlier.
        {0, 3, 3, "40 30 10 20", 2,
         [&](Model m) {
             part(m, 40).conversionCostMicroseconds = 30000;
             m.SetSpoolerDeliveryOrder({40, 777, 30, 40, 2, 99});
         }},
        // An alias in place of its reference; a failed conversion as no representation.
        {3, 1, 3, "10 2020 30 40", 0, [](Model m) { m.SetSpoolerIdAlias(20, 2020); }},
        {16, {}, 4, "10 20 30! 40", 0, [&](Model m) { part(m, 30).conversionFails = true; }},
        {0, 64, 4, "10 20 30 40", 0, [](Model) {}},
    };
    for (auto const& [toUse, physical, atMost, expected, anyOrderFrom, prepare] : cases) {
        SCOPED_TRACE(expected);
        TarvexScopedProcessors const processors(toUse, physical);
        TarvexModel model = MakeTestProduct(5000); // long enough for every worker to get a part
        prepare(model);
        TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
        ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
        EXPECT_EQ(Drain(spooler, anyOrderFrom), expected);
        std::set<std::optional<std::thread::id>> workers;
        for (unsigned int const id : {10u, 20u, 30u, 40u}) {
            workers.insert(model.GetConversionThread(id));
            // The host's own request is answered from what was converted.
            DocumentOf(model, id).GetConvertedPart();
            EXPECT_EQ(model.GetConversionCount(id), 1) << id;
        }
        workers.erase(std::this_thread::get_id()); // where the host converted first
        EXPECT_LE(workers.size(), atMost);
        EXPECT_EQ(workers.count(std::nullopt), 0u);
    }
    TarvexModel aliased = MakeTestProduct();
    aliased.SetSpoolerIdAlias(20, 2020);
    EXPECT_EQ(aliased.GetInputProductStructure().GetReferenceFromId(2020).GetUniqueID(), 20u);
}

TEST(TarvexSpoolerTest, StartsOnceForTheModelerReadyFormAndCompletesWhenAllIsHandedOver) {
    TarvexModel nothing;
    nothing.AddAssembly(1, u"Empty");
    nothing.AddPart(10, u"Unplaced");
    nothing.AddRootInstance(1, u"Empty.1");
    nothing.AddRootInstance(99, u"undefined");
    for (TarvexInputProductStructure const& input :
         {nothing.GetInputProductStructure(), TarvexInputProductStructure()}) {
        TarvexMultiProcessSpooler spooler(input);
        EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
        EXPECT_TRUE(spooler.IsComplete()) << "nothing to convert";
        unsigned int id = 5;
        EXPECT_FALSE(spooler.HasDataAvailableFor(id));
        EXPECT_EQ(id, 5u);
        EXPECT_EQ(spooler.GetActiveRepresentation(), TarvexRep_None);
    }
    EXPECT_EQ(nothing.GetConversionCount(10), 0);

    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel const model = MakeTestProduct(20000);
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_Visualization));
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_None));
    EXPECT_TRUE(spooler.IsComplete()) << "nothing was started";
    EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_BREP)) << "while it runs";
    // The host asks for every part while the workers convert them: each is converted once.
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        EXPECT_NE(DocumentOf(model, id).GetConvertedPart(), nullptr);
    }
    EXPECT_FALSE(spooler.IsComplete()) << "converted is not handed over";
    EXPECT_EQ(Drain(spooler), "10 20 30 40");
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        EXPECT_EQ(model.GetConversionCount(id), 1) << id;
    }
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_BREP)) << "after it finished";
}

TEST(TarvexSpoolerTest, StopsItsWorkersWhenDestroyedMidConversion) {
    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexModel model = MakeTestProduct();
    model.FindReference(10)->geometry.conversionCostMicroseconds = 200000;
    {
        TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
        ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
        auto const deadline = std::chrono::steady_clock::now() + std::chrono::minutes(1);
        while (model.GetConversionCount(10) == 0 && std::chrono::steady_clock::now() < deadline) {
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
    }
    // The conversion under way finished and is kept; no other part was started.
    EXPECT_EQ(model.GetConversionCount(10), 1);
    EXPECT_NE(DocumentOf(model, 10).GetConvertedPart(), nullptr);
    EXPECT_EQ(model.GetConversionCount(20) + model.GetConversionCount(30), 0);
}

TEST(TarvexSpoolerTest, LosesNoPartToAFaultedStartOrPollNorToTheModelGoingAway) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    auto model = std::make_unique<TarvexModel>(MakeTestProduct());
    model->FindReference(10)->geometry.conversionCostMicroseconds = 10000;
    for (char const* operation : {"TarvexMultiProcessSpooler::InitiateConversion",
                                  "TarvexMultiProcessSpooler::HasDataAvailableFor"}) {
        TarvexFault fault = FaultOn(operation);
        fault.times = 1;
        model->Faults().Add(fault);
    }
    TarvexMultiProcessSpooler spooler(model->GetInputProductStructure());
    EXPECT_THROW(spooler.InitiateConversion(TarvexRep_BREP), std::runtime_error);
    EXPECT_TRUE(spooler.IsComplete()) << "a faulted start starts nothing";
    ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    model.reset();
    unsigned int id = 0;
    EXPECT_THROW(spooler.HasDataAvailableFor(id), std::runtime_error);
    EXPECT_EQ(Drain(spooler), "10 20 30 40");
}

TEST(TarvexMultiProcessTest, UsesEveryProcessorByDefaultAndScopedGuardsRestoreTheSettings) {
    auto const settings = [] {
        return std::to_string(TarvexMultiProcess::GetNumberOfProcessorsToUse()) + " of " +
               std::to_string(TarvexMultiProcess::GetNumberOfPhysicalProcessors());
    };
    std::string const initial =
        "0 of " + std::to_string(std::max(int(std::thread::hardware_concurrency()), 1));
    EXPECT_EQ(settings(), initial);
    {
        TarvexScopedProcessors const outer(4, 8);
        {
            TarvexScopedProcessors const inner(1, std::nullopt);
            TarvexMultiProcess::SetNumberOfProcessorsToUse(-3);
            TarvexMultiProcess::SetPhysicalProcessorsOverride(-5);
            EXPECT_EQ(settings(), "0 of 1") << "out of range: the nearest meaningful count";
        }
        EXPECT_EQ(settings(), "4 of 8");
    }
    EXPECT_EQ(settings(), initial);
}

} // namespace

#include <VizBridge/contracts/tarvex/TarvexConvertedPart.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cmath>
#include <memory>
#include <stdexcept>
#include <thread>
#include <vector>

namespace {

using ::testing::ElementsAre;
using ::testing::FloatNear;
using ::testing::IsEmpty;
using ::testing::Pointwise;

/// The document of part `referenceId`, reached as a host reaches it.
TarvexPartDocument DocumentOf(TarvexModel const& model, unsigned int referenceId) {
    return model.GetInputProductStructure()
        .GetReferenceFromId(static_cast<int>(referenceId))
        .GetDocument();
}

/// A part 20 placed at the root; its geometry is for the test to fill.
struct PartModel {
    TarvexModel model;
    TarvexAuthoredPartGeometry& geometry;

    PartModel() : geometry(model.AddPart(20, u"Part", u"part.prt").geometry) {
        model.AddRootInstance(20, u"Part.1");
    }
    std::shared_ptr<TarvexConvertedPart const> Convert() const {
        return DocumentOf(model, 20).GetConvertedPart();
    }
};

std::vector<float> Box(TarvexConvertedPart const& part) {
    return {float(part.low[0]),  float(part.low[1]),  float(part.low[2]),
            float(part.high[0]), float(part.high[1]), float(part.high[2])};
}

TEST(TarvexConversionTest, MakesATriangleSoupWithUnitNormalsPerTriangle) {
    PartModel part;
    // A unit square in z = 0 facing up, and a slanted triangle facing (0, -1, 1).
    part.geometry.faces.push_back({7, {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0}, {0, 1, 2, 0, 2, 3}});
    part.geometry.faces.push_back({8, {0, 0, 0, 2, 0, 0, 0, 1, 1}, {0, 1, 2}});
    part.geometry.edges.push_back({9, {0, 0, 0, 1, 0, 0}});

    auto const converted = part.Convert();
    ASSERT_NE(converted, nullptr);
    ASSERT_EQ(converted->faces.size(), 2u);
    EXPECT_EQ(converted->faces[0].entityId, 7u);
    EXPECT_THAT(converted->faces[0].positions,
                ElementsAre(0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 0, 0, 1, 1, 0, 0, 1, 0));
    EXPECT_THAT(converted->faces[0].normals, ElementsAre(0, 0, 1, 0, 0, 1));
    EXPECT_EQ(converted->faces[1].entityId, 8u);
    EXPECT_THAT(converted->faces[1].positions, ElementsAre(0, 0, 0, 2, 0, 0, 0, 1, 1));
    float const half = 1.0f / std::sqrt(2.0f);
    EXPECT_THAT(converted->faces[1].normals,
                Pointwise(FloatNear(1e-6f), std::vector<float>{0, -half, half}));
    ASSERT_EQ(converted->edges.size(), 1u);
    EXPECT_EQ(converted->edges[0].entityId, 9u);
    EXPECT_THAT(converted->edges[0].points, ElementsAre(0, 0, 0, 1, 0, 0));
    EXPECT_FALSE(converted->empty);
    EXPECT_THAT(Box(*converted), ElementsAre(0, 0, 0, 2, 1, 1));
}

TEST(TarvexConversionTest, SkipsTrianglesWithVerticesThatDoNotExist) {
    PartModel part;
    // Three vertices (index 3 is the first that does not exist) and a trailing half triangle.
    part.geometry.faces.push_back(
        {1, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 3, 0, 1, 2, 4000000000u, 0, 1, 2, 1, 0, 0, 1}});

    auto const converted = part.Convert();
    ASSERT_NE(converted, nullptr);
    ASSERT_EQ(converted->faces.size(), 1u);
    EXPECT_THAT(converted->faces[0].positions,
                ElementsAre(0, 0, 0, 1, 0, 0, 0, 1, 0, 0, 1, 0, 1, 0, 0, 0, 0, 0));
    EXPECT_THAT(converted->faces[0].normals, ElementsAre(0, 0, 1, 0, 0, -1));
}

TEST(TarvexConversionTest, GivesDegenerateTrianglesAZeroNormal) {
    PartModel part;
    part.geometry.faces.push_back({1, {0, 0, 0, 1, 1, 1, 2, 2, 2}, {0, 1, 2, 0, 0, 1}});
    auto const converted = part.Convert();
    ASSERT_NE(converted, nullptr);
    EXPECT_THAT(converted->faces[0].normals, ElementsAre(0, 0, 0, 0, 0, 0));
}

TEST(TarvexConversionTest, BoxesEveryFaceVertexAndEdgePoint) {
    PartModel part;
    // Vertex (-5, 9, 0) is used by no triangle and still counts; so do edge points, and a
    // face without triangles. The trailing lone coordinate is no point.
    part.geometry.faces.push_back({1, {0, 0, 0, 1, 0, 0, 0, 1, 0, -5, 9, 0, 100}, {0, 1, 2}});
    part.geometry.faces.push_back({2, {0, 0, -3}, {}});
    part.geometry.edges.push_back({3, {4, -1, 2, 0, 0, 6}});

    auto const converted = part.Convert();
    ASSERT_NE(converted, nullptr);
    EXPECT_FALSE(converted->empty);
    EXPECT_THAT(Box(*converted), ElementsAre(-5, -1, -3, 4, 9, 6));
    ASSERT_EQ(converted->faces.size(), 2u);
    EXPECT_THAT(converted->faces[1].positions, IsEmpty());
    EXPECT_THAT(converted->edges[0].points, ElementsAre(4, -1, 2, 0, 0, 6));
}

TEST(TarvexConversionTest, APartWithoutPointsIsEmpty) {
    PartModel part;
    part.geometry.faces.push_back({1, {}, {0, 1, 2}});
    part.geometry.edges.push_back({2, {1, 2}});
    auto const converted = part.Convert();
    ASSERT_NE(converted, nullptr);
    EXPECT_TRUE(converted->empty);
    ASSERT_EQ(converted->faces.size(), 1u);
    EXPECT_THAT(converted->faces[0].positions, IsEmpty());
    EXPECT_THAT(converted->edges[0].points, ElementsAre(1, 2)) << "a polyline is copied as is";

    PartModel nothing;
    auto const none = nothing.Convert();
    ASSERT_NE(none, nullptr);
    EXPECT_TRUE(none->empty);
    EXPECT_THAT(none->faces, IsEmpty());
    EXPECT_THAT(none->edges, IsEmpty());
}

TEST(TarvexConversionTest, ConvertsOnceAndGivesTheSameObjectThroughEveryHandle) {
    PartModel part;
    part.geometry.faces.push_back({1, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    EXPECT_EQ(part.model.GetConversionCount(20), 0);
    EXPECT_EQ(part.model.GetConversionThread(20), std::nullopt);

    auto const first = part.Convert();
    TarvexPartDocument const other =
        part.model.GetInputProductStructure().GetRootInstance(0).GetReference().GetDocument();
    auto const second = other.GetConvertedPart();
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(first, second);
    EXPECT_EQ(part.model.GetConversionCount(20), 1);
    EXPECT_EQ(part.model.GetConversionThread(20), std::this_thread::get_id());

    // The result is kept: authoring the geometry afterwards changes nothing.
    part.geometry.faces.clear();
    EXPECT_EQ(part.Convert(), first);
    EXPECT_EQ(part.Convert()->faces.size(), 1u);
}

TEST(TarvexConversionTest, AFailedConversionIsNullAndNotTriedAgain) {
    PartModel part;
    part.geometry.faces.push_back({1, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    part.geometry.conversionFails = true;
    EXPECT_EQ(part.Convert(), nullptr);
    part.geometry.conversionFails = false;
    EXPECT_EQ(part.Convert(), nullptr);
    EXPECT_EQ(part.model.GetConversionCount(20), 1);
}

TEST(TarvexConversionTest, OnlyPartsOfTheModelConvert) {
    PartModel part;
    part.model.AddAssembly(10, u"Assembly");
    EXPECT_EQ(DocumentOf(part.model, 10).GetConvertedPart(), nullptr) << "a sub-assembly";
    EXPECT_EQ(TarvexPartDocument(nullptr, 20).GetConvertedPart(), nullptr);
    EXPECT_EQ(TarvexPartDocument().GetConvertedPart(), nullptr);
    EXPECT_EQ(part.model.GetConversionCount(10), 0);
    EXPECT_EQ(part.model.GetConversionCount(20), 0);
    EXPECT_EQ(TarvexModel().GetConversionCount(20), 0);
}

TEST(TarvexConversionTest, SpendsTheConversionCost) {
    PartModel part;
    part.geometry.conversionCostMicroseconds = 20000;
    auto const start = std::chrono::steady_clock::now();
    ASSERT_NE(part.Convert(), nullptr);
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::microseconds(20000));

    // A failing conversion costs its time too; a converted part costs nothing the second time.
    part.geometry.conversionFails = true;
    part.model.AddPart(30, u"Failing").geometry = part.geometry;
    auto const failingStart = std::chrono::steady_clock::now();
    EXPECT_EQ(DocumentOf(part.model, 30).GetConvertedPart(), nullptr);
    EXPECT_GE(std::chrono::steady_clock::now() - failingStart, std::chrono::microseconds(20000));
}

TEST(TarvexConversionTest, ConcurrentCallersShareOneConversion) {
    PartModel part;
    part.geometry.faces.push_back({1, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    // Long enough for the callers to overlap; the outcome does not depend on whether they do.
    part.geometry.conversionCostMicroseconds = 50000;
    TarvexPartDocument const document = DocumentOf(part.model, 20);

    std::vector<std::shared_ptr<TarvexConvertedPart const>> results(4);
    std::vector<std::thread> callers;
    for (auto& result : results) {
        callers.emplace_back([&document, &result] { result = document.GetConvertedPart(); });
    }
    for (std::thread& caller : callers) {
        caller.join();
    }
    ASSERT_NE(results[0], nullptr);
    EXPECT_THAT(results, ::testing::Each(results[0]));
    EXPECT_EQ(part.model.GetConversionCount(20), 1);
}

TEST(TarvexConversionTest, APlannedFaultThrowsBeforeConverting) {
    PartModel part;
    TarvexFault fault;
    fault.operation = "TarvexPartDocument::GetConvertedPart";
    fault.times = 1;
    part.model.Faults().Add(fault);
    TarvexPartDocument const document = DocumentOf(part.model, 20);
    EXPECT_THROW(document.GetConvertedPart(), std::runtime_error);
    EXPECT_EQ(part.model.GetConversionCount(20), 0);
    EXPECT_NE(document.GetConvertedPart(), nullptr);
    EXPECT_EQ(part.model.GetConversionCount(20), 1);
}

} // namespace

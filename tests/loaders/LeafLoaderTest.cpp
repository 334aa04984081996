#include "LoaderTestSupport.h"

#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/loaders/VizEdgeLoader.h>
#include <VizBridge/loaders/VizPointsLoader.h>
#include <VizBridge/loaders/VizPolygonLoader.h>

#include <gtest/gtest.h>

#include <optional>
#include <tuple>
#include <vector>

namespace {

using namespace LoaderTest;
using namespace VizBridgeTarvex;
using KolbaVizCore::VizEdge;
using KolbaVizCore::VizPoints;
using KolbaVizCore::VizPolygon;
using Floats = std::vector<float>;
using Indices = std::optional<std::vector<int>>;
using V = std::vector<int>;

Floats const kNine = {0, 1, 2, 3, 4, 5, 6, 7, 8};

struct EdgeCase {
    Indices indices;
    int lineType;
    std::optional<Floats> vertices; ///< absent: no edge at all
    VizEdge::EdgeType edgeType = VizEdge::UndefinedLine;
};

// Indices are offsets of floats; a closed line repeats its first point, if it has one.
std::vector<EdgeCase> const kEdgeCases = {
    {V{0, 3, 6}, 1, kNine, VizEdge::Polyline},
    {V{6, 0}, 1, Floats{6, 7, 8, 0, 1, 2}, VizEdge::Polyline},
    {V{1}, 1, Floats{1, 2, 3}, VizEdge::Polyline},
    {V{3, 6, 0}, 2, Floats{3, 4, 5, 6, 7, 8, 0, 1, 2, 3, 4, 5}, VizEdge::ClosedPolyline},
    {V{}, 2, Floats{}, VizEdge::ClosedPolyline},
    {V{0, 3, 3, 6}, 3, Floats{0, 1, 2, 3, 4, 5, 3, 4, 5, 6, 7, 8}, VizEdge::LineSegments},
    {V{0}, 0, Floats{0, 1, 2}, VizEdge::UndefinedLine},
    {V{0}, 4, Floats{0, 1, 2}, VizEdge::UndefinedLine},
    {std::nullopt, 1, std::nullopt},
    {V{0, 7}, 1, std::nullopt}, // past the points
    {V{-3}, 2, std::nullopt},
};

TEST(VizEdgeLoaderTest, ResolvesIndicesByLineType) {
    for (std::size_t i = 0; i < kEdgeCases.size(); ++i) {
        SCOPED_TRACE(i);
        EdgeCase const& c = kEdgeCases[i];
        TarvexAuthoredVisuEdge record;
        record.points = kNine;
        record.lineIndices = c.indices;
        record.lineType = static_cast<TarvexVisuLineType>(c.lineType);
        TarvexVisuEdge const source = Make<TarvexVisuEdge>(record);
        VizEdgeLoader loader(source, nullptr, true);
        auto const edge = LoadAs<VizEdge>(loader);
        ASSERT_EQ(edge != nullptr, c.vertices.has_value());
        if (edge) {
            EXPECT_EQ(edge->GetVertices(), *c.vertices);
            EXPECT_EQ(edge->GetLineType(), c.edgeType);
        }
    }
}

// Points resolve as an open line does, and a missing or broken index array gives nothing.
std::vector<std::tuple<Indices, std::optional<Floats>>> const kPointsCases = {
    {V{6, 0}, Floats{6, 7, 8, 0, 1, 2}}, {V{}, Floats{}}, {{}, {}}, {V{6, 9}, {}}};

TEST(VizPointsLoaderTest, ResolvesIndicesWithoutClosingPoint) {
    for (auto const& [indices, vertices] : kPointsCases) {
        TarvexVisuPoints const source =
            Make<TarvexVisuPoints>(TarvexAuthoredVisuPoints{kNine, indices, {}, {}});
        VizPointsLoader loader(source, nullptr, true);
        auto const points = LoadAs<VizPoints>(loader);
        ASSERT_EQ(points != nullptr, vertices.has_value());
        EXPECT_EQ(points ? points->GetVertices() : Floats{}, vertices.value_or(Floats{}));
    }
}

std::vector<std::tuple<int, KolbaVizCore::TriangleType>> const kPolygonTypes = {
    {0, KolbaVizCore::UndefinedTriangles}, {1, KolbaVizCore::Triangles},
    {2, KolbaVizCore::TriangleStrip},      {3, KolbaVizCore::TriangleFan},
    {4, KolbaVizCore::UndefinedTriangles}, {-1, KolbaVizCore::UndefinedTriangles}};

TEST(VizPolygonLoaderTest, CopiesIndicesAsOffsetsAndMapsTheType) {
    for (auto const& [type, expected] : kPolygonTypes) {
        TarvexVisuPolygon const source = Make<TarvexVisuPolygon>(
            TarvexAuthoredVisuPolygon{V{6, 0, 3}, static_cast<TarvexVisuPolygonType>(type)});
        VizPolygonLoader loader(source, nullptr, false);
        auto const polygon = LoadAs<VizPolygon>(loader);
        ASSERT_NE(polygon, nullptr);
        EXPECT_EQ(polygon->GetIndices(), (V{6, 0, 3}));
        EXPECT_EQ(polygon->GetPolygonType(), expected);
    }
    TarvexVisuPolygon const empty = Make<TarvexVisuPolygon>(TarvexAuthoredVisuPolygon{});
    VizPolygonLoader loader(empty, nullptr, false);
    auto const polygon = LoadAs<VizPolygon>(loader);
    ASSERT_NE(polygon, nullptr) << "a polygon without indices is still loaded";
    EXPECT_TRUE(polygon->GetIndices().empty());
}

} // namespace

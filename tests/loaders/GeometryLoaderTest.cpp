#include "LoaderTestSupport.h"

#include <gtest/gtest.h>

namespace {

using namespace LoaderTest;
using C = RGBAColor;
using V = std::vector<int>;

// Own rgb and alpha, inherit, the colour found (none: the colour is left alone), the stack
// (oldest first; empty: a null stack).
using ColorRow =
    std::tuple<std::optional<A>, std::optional<unsigned short>, bool, std::optional<C>, Entries>;
ColorRow const kColorRows[] = {
    // Own values win over the stack.
    {A{10, 20, 30}, 40, true, C(10, 20, 30, 40), {Entry(A{1, 2, 3}, 4)}},
    // Colour and alpha each come from the newest entry that has one.
    {A{10, 20, 30}, {}, true, C(10, 20, 30, 60), {Entry(A{1, 2, 3}, 50), Entry(A{4, 5, 6}, 60)}},
    {{}, {}, true, C(4, 5, 6, 50), {Entry(A{1, 2, 3}, 50), Entry(A{4, 5, 6}, {}), Entry({}, {})}},
    {{}, 70, true, C(4, 5, 6, 70), {Entry(A{4, 5, 6}, 9)}},
    // Without inheritance what is missing keeps the default's bytes.
    {{}, 70, false, C(0, 0, 0, 70), {Entry(A{4, 5, 6}, 9)}},
    {{}, {}, false, {}, {Entry(A{4, 5, 6}, 9)}},
    {{}, {}, true, {}, {Entry({}, {}), Entry({}, {})}},
    // Each channel enters by its low byte, on the source and up the stack.
    {A{0x1FF, 0x100, 0x1234}, 0x180, false, C(0xFF, 0x00, 0x34, 0x80), {}},
    {{}, {}, true, C(0xAB, 0x01, 0x00, 0xFE), {Entry(A{0x2AB, 0x301, 0xFF00}, 0x1FE)}},
};

TEST(VisuColorTest, FindsColourAndAlphaIndependently) {
    for (ColorRow const& row : kColorRows) {
        auto const& [rgb, alpha, inherit, expected, entries] = row;
        SCOPED_TRACE(&row - kColorRows);
        Stack stack = StackOf(entries);
        TarvexAuthoredVisuEdge const record{{}, {}, {}, TarvexVisuLine_Polyline, rgb, alpha};
        C color(1, 2, 3, 4);
        bool const found = resolveVisuColor(Make<TarvexVisuEdge>(record),
                                            entries.empty() ? nullptr : &stack, color, inherit);
        EXPECT_EQ(std::pair(found, color),
                  std::pair(expected.has_value(), expected.value_or(color)));
    }
}

// Line type (-1: the indices of a group of points), indices, what loads. Indices are offsets into
// the floats 0 to 8. A closed line repeats its first point, if it has one; an index array that is
// missing or names no three floats gives no element.
std::tuple<int, Indices, char const*> const kIndexRows[] = {
    {1, V{0, 6, 1}, "VizEdge Polyline[0 1 2 6 7 8 1 2 3]"},
    {2, V{3, 6, 0}, "VizEdge Closed[3 4 5 6 7 8 0 1 2 3 4 5]"},
    {2, V{}, "VizEdge Closed[]"},
    {3, V{0, 3, 3, 6}, "VizEdge Segments[0 1 2 3 4 5 3 4 5 6 7 8]"},
    {4, V{0}, "VizEdge Undefined[0 1 2]"},
    {1, std::nullopt, "null"},
    {1, V{0, 7}, "null"},
    {2, V{-3}, "null"},
    {-1, V{6, 0}, "VizPoints [6 7 8 0 1 2]"},
    {-1, V{}, "VizPoints []"},
    {-1, std::nullopt, "null"},
    {-1, V{6, 9}, "null"},
};

TEST(IndexedPointsTest, EdgesAndPointsResolveTheirIndices) {
    std::vector<float> const nine = {0, 1, 2, 3, 4, 5, 6, 7, 8};
    for (auto const& [type, indices, expected] : kIndexRows) {
        SCOPED_TRACE(::testing::PrintToString(indices));
        TarvexAuthoredVisuEdge const edge{{}, nine, indices, TarvexVisuLineType(type), {}, {}};
        TarvexAuthoredVisuPoints const points{nine, indices, {}, {}};
        EXPECT_EQ(type < 0 ? Loaded<VizPointsLoader>(Make<TarvexVisuPoints>(points))
                           : Loaded<VizEdgeLoader>(Make<TarvexVisuEdge>(edge)),
                  expected);
    }
}

// A mesh loads its ids, its faces with their polygons (offsets kept, types mapped), then its
// edges, leaving out those without indices. Its faces always look up the stack, its edges only
// when the mesh is asked to; edges of a wire and points of a point set always do. No parent takes
// a colour itself.
TEST(CompositeLoaderTest, LoadChildrenInOrderAndLetThemInherit) {
    Stack stack = StackOf({Entry(A{200, 100, 50}, 128)});
    TarvexAuthoredVisuMesh record{u"mesh", u"mm", TarvexVisuGeometry_Standard, {{}, {}}, {}};
    record.faces[0] = {u"f1", u"mf1", {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 0, 1, 0, 0, 1}, {}, {}, 10};
    using P = TarvexVisuPolygonType;
    record.faces[0].polygons = {
        {V{0, 3, 6}, P(1)}, {V{6, 3, 0}, P(2)}, {V{6, 3}, P(3)}, {{}, P(0)}, {V{3}, P(4)}};
    record.edges = {Line(V{0, 3}, u"e1"), Line({}, u"lost"), Line(V{3})};
    std::string const faces =
        "VizMesh id=mesh m=mm\n  VizFace id=f1 rgba(200,100,50,10) m=mf1 "
        "[0 0 0 1 0 0 0 1 0] n[0 0 1 0 0 1] Triangles[0 3 6] Strip[6 3 0] "
        "Fan[6 3] Undefined[] Undefined[3]\n  VizFace rgba(200,100,50,128) [] n[]\n";
    EXPECT_EQ(Loaded<VizMeshLoader>(Make<TarvexVisuMesh>(record), &stack, false),
              faces + "  VizEdge m=e1 Polyline[0 0 0 1 1 1]\n  VizEdge Polyline[1 1 1]");
    EXPECT_EQ(Loaded<VizMeshLoader>(Make<TarvexVisuMesh>(record), &stack, true),
              faces + "  VizEdge rgba(200,100,50,128) m=e1 Polyline[0 0 0 1 1 1]\n"
                      "  VizEdge rgba(200,100,50,128) Polyline[1 1 1]");
    EXPECT_EQ(Loaded<VizMeshLoader>(Make<TarvexVisuMesh>(TarvexAuthoredVisuMesh{})), "VizMesh");
    TarvexAuthoredVisuWire const wire{u"w", TarvexVisuGeometry_Standard, {Line(V{3}), Line({})}};
    TarvexAuthoredVisuPointSet set{TarvexVisuGeometry_Standard, {{{1, 2, 3}, V{0}, {}, 7}, {}}};
    EXPECT_EQ(Loaded<VizWireLoader>(Make<TarvexVisuWire>(wire), &stack),
              "VizWire id=w\n  VizEdge rgba(200,100,50,128) Polyline[1 1 1]");
    EXPECT_EQ(Loaded<VizPointSetLoader>(Make<TarvexVisuPointSet>(set), &stack),
              "VizPointSet\n  VizPoints rgba(200,100,50,7) [1 2 3]");
}

} // namespace

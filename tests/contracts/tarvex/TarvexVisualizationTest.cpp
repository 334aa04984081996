#include "support/TarvexTestProduct.h"
#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexPolicy.h>
#include <VizBridge/contracts/tarvex/TarvexVisu2DTextBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <filesystem>
#include <fstream>
#include <functional>
#include <limits>
#include <optional>
#include <random>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace {

TEST(TarvexVisuImporterTest, CopiesTheDataAsItStandsAndLogsEveryImport) {
    std::optional<TarvexVisuData> kept;
    {
        TarvexVisuTestModel test;
        test.Visu().nodes.resize(2);
        kept = test.Import();
        // Authoring after the import, also enough to move the node list, is not seen by it.
        test.Visu().nodes.resize(100);
        test.Visu().nodes[0].type = TarvexVisuNode::VisuMesh;
        TarvexFault fault = FaultOn("TarvexVisualizationImporter::Import");
        fault.times = 1;
        test.model.Faults().Add(fault);
        EXPECT_THROW(test.Import(), std::runtime_error);
        TarvexVisualizationImporter().ImportWithPolicy(TarvexPolicy(), test.Document());
        EXPECT_EQ(
            test.model.GetImportCalls(),
            (std::vector<TarvexImportCall>{{"TarvexVisualizationImporter::Import", 20},
                                           {"TarvexVisualizationImporter::Import", 20},
                                           {"TarvexVisualizationImporter::ImportWithPolicy", 20}}));
    }
    std::vector<TarvexVisuNode> const nodes = Items(kept->GetNodeIterator());
    ASSERT_EQ(nodes.size(), 2u);
    EXPECT_EQ(nodes[0].GetType(), TarvexVisuNode::VisuUnknown);
}

TEST(TarvexVisuImporterTest, RefusesADocumentOfNoModelAndIndicesPastTheirCoordinates) {
    EXPECT_EQ(Outcome([] { TarvexVisualizationImporter().Import(TarvexPartDocument()); }),
              "TarvexVisualizationImporter::Import: the document names no part");
    TarvexAuthoredVisuEdge const past{{}, {0, 0, 0}, {{3}}, {}, {}, {}};
    TarvexAuthoredVisuEdge const before{{}, {0, 0, 0}, {{-3}}, {}, {}, {}};
    TarvexAuthoredVisuPoints const points{{0, 0, 0}, {{3}}, {}, {}};
    // Vertices enough, normals not.
    TarvexAuthoredVisuFace const face{{}, {}, {0, 0, 0, 1, 1, 1}, {0, 0, 1}, {{{{0, 3}}}}, {}, {}};
    std::pair<std::function<void(TarvexAuthoredVisuNode&)>, char const*> const cases[] = {
        {[&](auto& n) { n.mesh.edges.push_back(past); }, "edge"},
        {[&](auto& n) { n.wire.edges.push_back(before); }, "edge"},
        {[&](auto& n) { n.pointSet.points.push_back(points); }, "point"},
        {[&](auto& n) { n.mesh.faces.push_back(face); }, "polygon"},
    };
    for (auto const& [spoil, what] : cases) {
        TarvexVisuTestModel test;
        test.Visu().nodes.resize(1);
        spoil(test.Visu().nodes.emplace_back());
        EXPECT_EQ(Outcome([&test] { test.Import(); }),
                  std::string("TarvexVisualizationImporter::Import: node 1 has ") + what +
                      " indices outside its coordinates");
    }
}

using Font = TarvexAuthoredVisuFont;
using Vector = std::array<double, 3>;

/// A text "string" in `font`, at `anchor`, running along `direction` and facing `normal`.
TarvexAuthoredVisuText Text(std::optional<VizPort::WString> string, Font font = {},
                            std::array<float, 3> direction = {1, 0, 0},
                            std::array<float, 3> normal = {0, 0, 1},
                            std::array<float, 3> anchor = {0, 0, 0}) {
    return {std::move(string), anchor, direction, normal, std::move(font), {}, {}};
}

/// Builds `text`, with its own font, as a PMI text of an imported part.
TarvexVisuBuild2DTextResult Build(TarvexAuthoredVisuText const& text,
                                  std::optional<std::string> const& fontDirectory = {},
                                  std::optional<TarvexFault> const& fault = {}) {
    TarvexVisuTestModel test;
    test.model.SetFontDirectory(fontDirectory);
    if (fault)
        test.model.Faults().Add(*fault);
    test.Visu().nodes.emplace_back().pmi.texts.push_back(text);
    TarvexVisuText const read = Items(test.Nodes().at(0).GetPMI().GetTextIterator()).at(0);
    TarvexVisuFont font;
    read.GetFont(font);
    return TarvexVisu2DTextBuilder().Build2DText(read, font);
}

/// What a build gave, read back through the result's iterators.
struct Layout {
    int strokes = 0;
    int faces = 0;
    bool closed = true;  ///< every stroke is a closed polyline
    bool normals = true; ///< every face vertex carries the text's unit normal
    double area = 0;     ///< of the filled triangles, signed by the side they face
    Vector low{1e300, 1e300, 1e300};
    Vector high{-1e300, -1e300, -1e300};

    double Extent(int axis) const { return high[axis] - low[axis]; }
    void Add(float const* p) {
        for (int axis = 0; axis < 3; ++axis) {
            low[axis] = std::min(low[axis], double(p[axis]));
            high[axis] = std::max(high[axis], double(p[axis]));
        }
    }
};

Layout Lay(TarvexAuthoredVisuText const& text) {
    TarvexVisuBuild2DTextResult const result = Build(text);
    double const length = std::hypot(text.normal[0], text.normal[1], text.normal[2]);
    Vector const n{text.normal[0] / length, text.normal[1] / length, text.normal[2] / length};
    Layout layout;
    for (TarvexVisuEdge const& edge : Items(result.GetStrokedFontTextIterator())) {
        ++layout.strokes;
        float const* points = nullptr;
        int const* indices = nullptr;
        TarvexVisuLineType type = TarvexVisuLine_Unknown;
        edge.GetPoints(points);
        int const count = edge.GetLineIndices(indices, type);
        layout.closed = layout.closed && type == TarvexVisuLine_ClosedPolyline;
        for (int i = 0; i < count; ++i)
            layout.Add(points + indices[i]);
    }
    for (TarvexVisuFace const& face : Items(result.GetFilledFontTextIterator())) {
        ++layout.faces;
        float const* v = nullptr;
        float const* normals = nullptr;
        int const count = face.GetVertices(v);
        layout.normals = layout.normals && face.GetNormals(normals) == count;
        for (int i = 0; i < count; ++i)
            layout.normals = layout.normals && std::abs(normals[i] - n[i % 3]) < 1e-6;
        for (TarvexVisuPolygon const& polygon : Items(face.GetPolygonIterator())) {
            int const* corner = nullptr;
            TarvexVisuPolygonType type = TarvexVisuPolygon_Unknown;
            int const corners = polygon.GetPolygonIndices(corner, type);
            EXPECT_EQ(type, TarvexVisuPolygon_Triangles);
            for (int i = 0; i + 2 < corners; i += 3) {
                float const *a = v + corner[i], *b = v + corner[i + 1], *c = v + corner[i + 2];
                layout.Add(a);
                Vector const u{b[0] - a[0], b[1] - a[1], b[2] - a[2]};
                Vector const w{c[0] - a[0], c[1] - a[1], c[2] - a[2]};
                layout.area +=
                    ((u[1] * w[2] - u[2] * w[1]) * n[0] + (u[2] * w[0] - u[0] * w[2]) * n[1] +
                     (u[0] * w[1] - u[1] * w[0]) * n[2]) /
                    2;
            }
        }
    }
    return layout;
}

TEST(TarvexVisu2DTextBuilderTest, GivesAClosedStrokePerContourAndAFilledFacePerGlyph) {
    Layout const layout = Lay(Text(u"A B8"));
    // "A" has one hole, "B" and "8" two each; the blank has no outline.
    EXPECT_EQ(layout.strokes, 2 + 3 + 3);
    EXPECT_EQ(layout.faces, 3);
    EXPECT_TRUE(layout.closed);
    EXPECT_TRUE(layout.normals);
    EXPECT_GT(layout.area, 0) << "filled glyphs face the normal";
    EXPECT_EQ(Lay(Text(u"  ")).strokes + Lay(Text(u"  ")).faces, 0) << "blanks lay out to nothing";
}

TEST(TarvexVisu2DTextBuilderTest, LaysOutAlongTheDirectionInThePlaneLineByLine) {
    // What of the direction runs along the normal does not count.
    Layout const layout = Lay(Text(u"HH", {{}, 5, {}, {}}, {1, 2, 0}, {3, 0, 0}, {10, 20, 30}));
    // In the plane through the anchor, running along +y, capitals standing 5 tall along z.
    EXPECT_NEAR(layout.low[0], 10, 1e-4);
    EXPECT_NEAR(layout.high[0], 10, 1e-4);
    EXPECT_NEAR(layout.low[2], 30, 1e-4);
    EXPECT_NEAR(layout.high[2], 35, 1e-4);
    EXPECT_GT(layout.low[1], 20);
    EXPECT_GT(layout.Extent(1), 5) << "two capitals are wider than one is tall";
    EXPECT_TRUE(layout.normals) << "normals are of unit length";

    Layout const lines = Lay(Text(u"H\r\nH"));
    EXPECT_EQ(lines.faces, 2);
    EXPECT_NEAR(lines.Extent(0), Lay(Text(u"H")).Extent(0), 1e-5) << "each line starts anew";
    EXPECT_NEAR(lines.high[1], 1, 1e-5);
    EXPECT_LT(lines.low[1], -1) << "the second line stands below the first";
}

TEST(TarvexVisu2DTextBuilderTest, TheFontShapesTheText) {
    // The height scales the text, the width scaling its length and the spacing its advances.
    Layout const base = Lay(Text(u"Hello", {{}, 2, {}, {}}));
    Layout const taller = Lay(Text(u"Hello", {{}, 4, {}, {}}));
    EXPECT_NEAR(taller.Extent(0), 2 * base.Extent(0), 1e-4);
    EXPECT_NEAR(taller.Extent(1), 2 * base.Extent(1), 1e-4);
    EXPECT_NEAR(taller.area, 4 * base.area, 1e-3);
    Layout const wider = Lay(Text(u"Hello", {{}, 2, {}, 3}));
    EXPECT_NEAR(wider.Extent(0), 3 * base.Extent(0), 1e-4);
    EXPECT_NEAR(wider.Extent(1), base.Extent(1), 1e-4);
    Layout const spaced = Lay(Text(u"Hello", {{}, 2, 2, {}}));
    EXPECT_GT(spaced.Extent(0), 1.5 * base.Extent(0));
    EXPECT_NEAR(spaced.area, base.area, 1e-3);
    // The font name picks the font file.
    EXPECT_EQ(TarvexFontCache::FileNameFor(u""), "DejaVuSans.ttf");
    EXPECT_EQ(TarvexFontCache::FileNameFor(u"MONOSPACE Bold"), "DejaVuSansMono-Bold.ttf");
    EXPECT_EQ(TarvexFontCache::FileNameFor(u"Times New Roman"), "DejaVuSerif.ttf");
    EXPECT_EQ(TarvexFontCache::FileNameFor(u"Microsoft Sans Serif"), "DejaVuSans.ttf");
    EXPECT_GT(Lay(Text(u"iiii", {u"Courier New", {}, {}, {}})).Extent(0),
              1.5 * Lay(Text(u"iiii")).Extent(0));
}

TEST(TarvexVisu2DTextBuilderTest, GivesTheGlyphsItsDocumentHoldsAsTheyAre) {
    // Neither a string nor a font that could lay one out is needed.
    TarvexAuthoredVisuText text = Text(std::nullopt, {{}, -1, {}, {}});
    text.glyphs = TarvexAuthoredVisuGlyphs{
        {{{}, {7, 0, 0, 9, 0, 0}, {{0, 3}}, TarvexVisuLine_Polyline, {}, {}}},
        {{{},
          {},
          {0, 0, 0, 2, 0, 0, 0, 3, 0},
          {0, 0, 1, 0, 0, 1, 0, 0, 1},
          {{{{0, 3, 6}}}},
          {},
          {}}}};
    Layout const layout = Lay(text);
    EXPECT_EQ(layout.strokes + layout.faces, 2);
    EXPECT_FALSE(layout.closed) << "a stroke keeps its own line type";
    EXPECT_NEAR(layout.area, 3, 1e-6);
    EXPECT_NEAR(layout.high[0], 9, 1e-6);
    EXPECT_EQ(
        Outcome([&text] { Build(text, {}, FaultOn("TarvexVisu2DTextBuilder::Build2DText")); }),
        "TarvexVisu2DTextBuilder::Build2DText");
    text.glyphs->faces[0].polygons[0].indices->push_back(9);
    EXPECT_EQ(Outcome([&text] { Build(text); }), "TarvexVisu2DTextBuilder::Build2DText: a face of "
                                                 "the glyphs has indices outside its vertices");
}

TEST(TarvexVisu2DTextBuilderTest, RefusesWhatItCannotLayOutAndSaysWhy) {
    float const nan = std::numeric_limits<float>::quiet_NaN();
    float const infinity = std::numeric_limits<float>::infinity();
    std::pair<TarvexAuthoredVisuText, char const*> const cases[] = {
        {Text(std::nullopt), "there is no text"},
        {Text(u""), "there is no text"},
        {Text(u"H", {{}, 0, {}, {}}), "the text height is not a positive number"},
        {Text(u"H", {{}, nan, {}, {}}), "the text height is not a positive number"},
        {Text(u"H", {{}, {}, -1, {}}), "the spacing factor is not a positive number"},
        {Text(u"H", {{}, {}, {}, 0}), "the width scaling factor is not a positive number"},
        {Text(u"H", {}, {1, 0, 0}, {0, 0, 1}, {0, infinity, 0}), "the anchor is not finite"},
        {Text(u"H", {}, {nan, 0, 0}), "the direction is not finite"},
        {Text(u"H", {}, {1, 0, 0}, {0, 0, 0}), "the normal has no length"},
        {Text(u"H", {}, {0, 0, 0}), "the direction is zero or runs along the normal"},
        {Text(u"H", {}, {0, 0, -4}), "the direction is zero or runs along the normal"},
    };
    for (auto const& [text, why] : cases) {
        EXPECT_EQ(Outcome([&text] { Build(text); }),
                  std::string("TarvexVisu2DTextBuilder::Build2DText: ") + why);
    }
    EXPECT_THROW(Build(Text(u"")), std::invalid_argument);
    // A font directory without the file, or with a file that is no font.
    EXPECT_THROW(Build(Text(u"H"), "/nonexistent/fonts"), std::runtime_error);
    EXPECT_EQ(Outcome([] { Build(Text(u"H"), "/nonexistent/fonts"); }),
              "TarvexGlyphSource: cannot read the font file /nonexistent/fonts/DejaVuSans.ttf");
    std::filesystem::path const junk =
        ::testing::TempDir() + "tarvex-junk-fonts-" + std::to_string(std::random_device()());
    std::filesystem::create_directories(junk);
    std::ofstream(junk / "DejaVuSans.ttf") << "not a font";
    EXPECT_EQ(Outcome([&junk] { Build(Text(u"H"), junk.string()); }),
              "TarvexGlyphSource: cannot read the font file " + (junk / "DejaVuSans.ttf").string());
    std::filesystem::remove_all(junk);
}

} // namespace

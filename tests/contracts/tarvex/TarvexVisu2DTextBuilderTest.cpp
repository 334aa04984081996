#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexVisu2DTextBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <functional>
#include <limits>
#include <memory>
#include <optional>
#include <ostream>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using Vector = std::array<double, 3>;

/// What a build gave, read back through the result's iterators.
struct Geometry {
    int strokes = 0;
    int faces = 0;
    std::vector<Vector> points; ///< of strokes and faces alike
    double faceArea = 0;        ///< of all triangles
    bool strokesClosed = true;
    bool normalsMatch = true;
    Vector low{1e300, 1e300, 1e300};
    Vector high{-1e300, -1e300, -1e300};

    double Extent(int axis) const { return high[axis] - low[axis]; }
};

Vector At(float const* floats, int offset) {
    return {floats[offset], floats[offset + 1], floats[offset + 2]};
}

Geometry Read(TarvexVisuBuild2DTextResult const& result, Vector const& normal) {
    Geometry geometry;
    auto const add = [&geometry](Vector const& p) {
        geometry.points.push_back(p);
        for (int axis = 0; axis < 3; ++axis) {
            geometry.low[axis] = std::min(geometry.low[axis], p[axis]);
            geometry.high[axis] = std::max(geometry.high[axis], p[axis]);
        }
    };
    for (TarvexVisuEdge const& edge : Items(result.GetStrokedFontTextIterator())) {
        ++geometry.strokes;
        float const* points = nullptr;
        edge.GetPoints(points);
        int const* indices = nullptr;
        TarvexVisuLineType type = TarvexVisuLine_Unknown;
        int const count = edge.GetLineIndices(indices, type);
        geometry.strokesClosed = geometry.strokesClosed && type == TarvexVisuLine_ClosedPolyline;
        for (int i = 0; i < count; ++i) {
            add(At(points, indices[i]));
        }
    }
    for (TarvexVisuFace const& face : Items(result.GetFilledFontTextIterator())) {
        ++geometry.faces;
        float const* vertices = nullptr;
        float const* normals = nullptr;
        int const count = face.GetVertices(vertices);
        EXPECT_EQ(face.GetNormals(normals), count);
        for (int offset = 0; offset < count; offset += 3) {
            Vector const n = At(normals, offset);
            for (int axis = 0; axis < 3; ++axis) {
                geometry.normalsMatch =
                    geometry.normalsMatch && std::abs(n[axis] - normal[axis]) < 1e-6;
            }
        }
        for (TarvexVisuPolygon const& polygon : Items(face.GetPolygonIterator())) {
            int const* indices = nullptr;
            TarvexVisuPolygonType type = TarvexVisuPolygon_Unknown;
            int const n = polygon.GetPolygonIndices(indices, type);
            EXPECT_EQ(type, TarvexVisuPolygon_Triangles);
            for (int corner = 0; corner + 2 < n; corner += 3) {
                Vector const a = At(vertices, indices[corner]);
                Vector const b = At(vertices, indices[corner + 1]);
                Vector const c = At(vertices, indices[corner + 2]);
                add(a);
                // The triangle's area, signed by the side the normal faces.
                Vector const u{b[0] - a[0], b[1] - a[1], b[2] - a[2]};
                Vector const v{c[0] - a[0], c[1] - a[1], c[2] - a[2]};
                Vector const cross{u[1] * v[2] - u[2] * v[1], u[2] * v[0] - u[0] * v[2],
                                   u[0] * v[1] - u[1] * v[0]};
                geometry.faceArea +=
                    (cross[0] * normal[0] + cross[1] * normal[1] + cross[2] * normal[2]) / 2;
            }
        }
    }
    return geometry;
}

/// A text in a PMI of an imported part, built with the font `font`.
struct TextCase {
    std::optional<std::u16string> text = u"H";
    std::array<float, 3> anchor{0, 0, 0};
    std::array<float, 3> direction{1, 0, 0};
    std::array<float, 3> normal{0, 0, 1};
    TarvexAuthoredVisuFont font;
    std::optional<std::string> fontDirectory;

    TarvexVisuBuild2DTextResult Build() const {
        TarvexVisuTestModel test;
        test.model.SetFontDirectory(fontDirectory);
        TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
        node.type = TarvexVisuNode::VisuNote;
        node.attributes.font = font;
        node.pmi.texts.push_back({text, anchor, direction, normal, std::nullopt, {}, {}});
        TarvexVisuNode const read = test.Nodes().at(0);
        TarvexVisuFont builderFont;
        read.GetAttributes().GetFont(builderFont);
        return TarvexVisu2DTextBuilder().Build2DText(Items(read.GetPMI().GetTextIterator()).at(0),
                                                     builderFont);
    }

    Geometry Lay() const {
        double const length =
            std::sqrt(double(normal[0]) * normal[0] + double(normal[1]) * normal[1] +
                      double(normal[2]) * normal[2]);
        return Read(Build(), {normal[0] / length, normal[1] / length, normal[2] / length});
    }
};

TEST(TarvexVisu2DTextBuilderTest, GivesAStrokePerContourAndAFilledFacePerGlyph) {
    TextCase text;
    text.text = u"A B8";
    Geometry const geometry = text.Lay();
    // "A" has one hole, "B" and "8" two each; the blank has no outline.
    EXPECT_EQ(geometry.strokes, 2 + 3 + 3);
    EXPECT_EQ(geometry.faces, 3);
    EXPECT_TRUE(geometry.strokesClosed);
    EXPECT_TRUE(geometry.normalsMatch);
    EXPECT_GT(geometry.faceArea, 0) << "filled glyphs face the normal";
}

TEST(TarvexVisu2DTextBuilderTest, LaysOutAlongTheDirectionWithCapitalsAsTallAsTheHeight) {
    TextCase text;
    text.text = u"HH";
    text.anchor = {10, 20, 30};
    text.direction = {0, 2, 0};
    text.normal = {3, 0, 0};
    text.font.textHeight = 5;
    Geometry const geometry = text.Lay();
    // In the plane through the anchor, running along +y, glyphs standing up along z.
    EXPECT_NEAR(geometry.low[0], 10, 1e-4);
    EXPECT_NEAR(geometry.high[0], 10, 1e-4);
    EXPECT_NEAR(geometry.low[2], 30, 1e-4);
    EXPECT_NEAR(geometry.high[2], 35, 1e-4);
    EXPECT_GT(geometry.low[1], 20);
    EXPECT_GT(geometry.Extent(1), 5) << "two capitals are wider than one is tall";
    EXPECT_TRUE(geometry.normalsMatch) << "normals are of unit length";
}

TEST(TarvexVisu2DTextBuilderTest, HeightScalesTheTextAndWidthScalingOnlyItsLength) {
    TextCase text;
    text.text = u"Hello";
    text.font.textHeight = 2;
    Geometry const base = text.Lay();
    text.font.textHeight = 4;
    Geometry const taller = text.Lay();
    EXPECT_NEAR(taller.Extent(0), 2 * base.Extent(0), 1e-4);
    EXPECT_NEAR(taller.Extent(1), 2 * base.Extent(1), 1e-4);
    EXPECT_NEAR(taller.faceArea, 4 * base.faceArea, 1e-3);

    text.font.textHeight = 2;
    text.font.widthScalingFactor = 3;
    Geometry const wider = text.Lay();
    EXPECT_NEAR(wider.Extent(0), 3 * base.Extent(0), 1e-4);
    EXPECT_NEAR(wider.Extent(1), base.Extent(1), 1e-4);

    // Spacing stretches the advances, not the glyphs.
    text.font.widthScalingFactor = std::nullopt;
    text.font.spacingFactor = 2;
    Geometry const spaced = text.Lay();
    EXPECT_GT(spaced.Extent(0), 1.5 * base.Extent(0));
    EXPECT_NEAR(spaced.faceArea, base.faceArea, 1e-3);
}

TEST(TarvexVisu2DTextBuilderTest, ADirectionOutOfThePlaneIsMadeToLieInIt) {
    TextCase flat;
    flat.text = u"Ab";
    TextCase tilted = flat;
    tilted.direction = {1, 0, 1};
    Geometry const a = flat.Lay();
    Geometry const b = tilted.Lay();
    ASSERT_EQ(a.points.size(), b.points.size());
    for (std::size_t i = 0; i < a.points.size(); ++i) {
        for (int axis = 0; axis < 3; ++axis) {
            EXPECT_NEAR(a.points[i][axis], b.points[i][axis], 1e-5);
        }
    }
}

TEST(TarvexVisu2DTextBuilderTest, ANewLineStartsOneLineBelowAtTheAnchor) {
    TextCase text;
    text.text = u"H\r\nH";
    Geometry const geometry = text.Lay();
    EXPECT_EQ(geometry.faces, 2);
    TextCase single;
    Geometry const one = single.Lay();
    EXPECT_NEAR(geometry.Extent(0), one.Extent(0), 1e-5) << "the second line starts again";
    EXPECT_NEAR(geometry.high[1], 1, 1e-5);
    EXPECT_LT(geometry.low[1], -1) << "the second line stands below the first";
}

TEST(TarvexVisu2DTextBuilderTest, TheFontNamePicksTheFontFile) {
    TextCase proportional;
    proportional.text = u"iiii";
    TextCase mono = proportional;
    mono.font.name = u"Courier New";
    EXPECT_GT(mono.Lay().Extent(0), 1.5 * proportional.Lay().Extent(0));

    TextCase blank;
    blank.text = u"  ";
    Geometry const nothing = blank.Lay();
    EXPECT_EQ(nothing.strokes + nothing.faces, 0) << "blanks lay out to nothing, without error";
}

struct FontFileCase {
    std::u16string name;
    char const* file;
};

void PrintTo(FontFileCase const& c, std::ostream* os) {
    *os << c.file;
}

class TarvexFontFileTest : public ::testing::TestWithParam<FontFileCase> {};

TEST_P(TarvexFontFileTest, MapsTheNameToADejaVuFile) {
    EXPECT_EQ(TarvexFontCache::FileNameFor(GetParam().name), GetParam().file);
}

INSTANTIATE_TEST_SUITE_P(
    Names, TarvexFontFileTest,
    ::testing::Values(FontFileCase{u"", "DejaVuSans.ttf"}, FontFileCase{u"Arial", "DejaVuSans.ttf"},
                      FontFileCase{u"Courier New", "DejaVuSansMono.ttf"},
                      FontFileCase{u"MONOSPACE Bold", "DejaVuSansMono-Bold.ttf"},
                      FontFileCase{u"Times New Roman", "DejaVuSerif.ttf"},
                      FontFileCase{u"serif bold", "DejaVuSerif-Bold.ttf"},
                      FontFileCase{u"Microsoft Sans Serif", "DejaVuSans.ttf"},
                      FontFileCase{u"Arial Bold", "DejaVuSans-Bold.ttf"}));

struct FailureCase {
    char const* name;
    std::function<void(TextCase&)> spoil;
    bool fontFileProblem = false;
};

void PrintTo(FailureCase const& c, std::ostream* os) {
    *os << c.name;
}

class TarvexTextBuilderFailureTest : public ::testing::TestWithParam<FailureCase> {};

TEST_P(TarvexTextBuilderFailureTest, ThrowsForTextItCannotLayOut) {
    TextCase text;
    GetParam().spoil(text);
    if (GetParam().fontFileProblem) {
        EXPECT_THROW(text.Build(), std::runtime_error);
    } else {
        EXPECT_THROW(text.Build(), std::invalid_argument);
    }
}

/// A directory whose DejaVu file holds no font; removed when the tests end.
class JunkFontDirectory {
public:
    JunkFontDirectory()
        : m_path(std::filesystem::temp_directory_path() /
                 ("tarvex-junk-fonts-" +
                  std::to_string(::testing::UnitTest::GetInstance()->random_seed()) + "-" +
                  std::to_string(reinterpret_cast<std::uintptr_t>(this)))) {
        std::filesystem::create_directories(m_path);
        std::ofstream(m_path / "DejaVuSans.ttf") << "not a font";
    }
    ~JunkFontDirectory() {
        std::error_code ignored;
        std::filesystem::remove_all(m_path, ignored);
    }
    JunkFontDirectory(JunkFontDirectory const&) = delete;
    JunkFontDirectory& operator=(JunkFontDirectory const&) = delete;

    static std::string Get() {
        static JunkFontDirectory const directory;
        return directory.m_path.string();
    }

private:
    std::filesystem::path m_path;
};

float const kNaN = std::numeric_limits<float>::quiet_NaN();
float const kInfinity = std::numeric_limits<float>::infinity();

INSTANTIATE_TEST_SUITE_P(
    Cases, TarvexTextBuilderFailureTest,
    ::testing::Values(
        FailureCase{"NoText", [](TextCase& t) { t.text.reset(); }},
        FailureCase{"EmptyText", [](TextCase& t) { t.text = u""; }},
        FailureCase{"ZeroHeight", [](TextCase& t) { t.font.textHeight = 0; }},
        FailureCase{"NegativeHeight", [](TextCase& t) { t.font.textHeight = -2; }},
        FailureCase{"NaNHeight", [](TextCase& t) { t.font.textHeight = kNaN; }},
        FailureCase{"ZeroWidthScaling", [](TextCase& t) { t.font.widthScalingFactor = 0; }},
        FailureCase{"NegativeSpacing", [](TextCase& t) { t.font.spacingFactor = -1; }},
        FailureCase{"InfiniteAnchor", [](TextCase& t) { t.anchor[1] = kInfinity; }},
        FailureCase{"NaNDirection", [](TextCase& t) { t.direction[0] = kNaN; }},
        FailureCase{"ZeroNormal",
                    [](TextCase& t) {
                        t.normal = {0, 0, 0};
                    }},
        FailureCase{"ZeroDirection",
                    [](TextCase& t) {
                        t.direction = {0, 0, 0};
                    }},
        FailureCase{"DirectionAlongTheNormal",
                    [](TextCase& t) {
                        t.direction = {0, 0, -4};
                    }},
        FailureCase{"MissingFontFile", [](TextCase& t) { t.fontDirectory = "/nonexistent/fonts"; },
                    true},
        FailureCase{"NotAFontFile", [](TextCase& t) { t.fontDirectory = JunkFontDirectory::Get(); },
                    true}),
    [](::testing::TestParamInfo<FailureCase> const& info) { return info.param.name; });

TEST(TarvexVisu2DTextBuilderTest, ADefaultTextHasNothingToLayOut) {
    EXPECT_THROW(TarvexVisu2DTextBuilder().Build2DText(TarvexVisuText(), TarvexVisuFont()),
                 std::invalid_argument);
    auto const record = std::make_shared<TarvexAuthoredVisuText const>(
        TarvexAuthoredVisuText{u"no model", {}, {1, 0, 0}, {0, 0, 1}, {}, {}, {}});
    EXPECT_THROW(TarvexVisu2DTextBuilder().Build2DText(TarvexVisuText(TarvexVisuContext(), record),
                                                       TarvexVisuFont()),
                 std::invalid_argument);
    EXPECT_EQ(TarvexVisuBuild2DTextResult().GetStrokedFontTextIterator().GetCount(), 0);
}

} // namespace

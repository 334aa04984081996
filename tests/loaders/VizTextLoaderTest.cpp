#include "ImportedVisu.h"
#include "LoaderTestSupport.h"

#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/loaders/VizTextLoader.h>

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace {

using namespace LoaderTest;
using KolbaVizCore::RGBAColor;
using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizText;
using VizBridgeTarvex::VizTextLoader;
using Font = std::optional<TarvexAuthoredVisuFont>;

struct FontCase {
    char const* name;
    Font own;
    std::vector<Font> stack; ///< oldest first
    std::u16string fontName;
    float size, spacing, widthScaling;
};

class VizTextLoaderFontTest : public ::testing::TestWithParam<FontCase> {};

TEST_P(VizTextLoaderFontTest, TakesItsOwnFontElseTheNewestOfTheStackWithOnesForMissingValues) {
    FontCase const& c = GetParam();
    TarvexAuthoredVisuText record = TextRecord(u"x");
    record.font = c.own;
    std::vector<TarvexAuthoredVisuAttributes> entries(c.stack.size());
    for (std::size_t i = 0; i < c.stack.size(); ++i)
        entries[i].font = c.stack[i];
    std::vector<TarvexVisuAttributes> stack = Stack(entries);
    TarvexVisuText const source = Make<TarvexVisuText>(record);
    VizTextLoader loader(source, &stack, false);
    std::unique_ptr<VizText> const text = LoadAs<VizText>(loader);
    ASSERT_TRUE(text);
    EXPECT_EQ(text->GetFontName(), c.fontName);
    EXPECT_EQ(text->GetFontAttrs(), (KolbaVizCore::FontAttr{c.size, c.spacing, c.widthScaling}));
}

using F = TarvexAuthoredVisuFont;
INSTANTIATE_TEST_SUITE_P(
    Cases, VizTextLoaderFontTest,
    ::testing::Values(FontCase{"NoFontAnywhere", {}, {Font{}}, u"", 1, 1, 1},
                      FontCase{"HeightWithoutSpacing", F{{}, 2.5f, {}, {}}, {}, u"", 2.5f, 1, 1},
                      FontCase{"OwnBeforeStack",
                               F{u"Arial", 3, 1.5f, 0.5f},
                               {F{u"Mono", 9, 9, 9}},
                               u"Arial",
                               3,
                               1.5f,
                               0.5f},
                      // The newest font counts whole: nothing is filled in from older ones.
                      FontCase{"NewestOfStack",
                               {},
                               {F{u"Serif", 4, 2, 2}, F{u"Mono", 5, {}, {}}, {}},
                               u"Mono",
                               5,
                               1,
                               1}),
    [](::testing::TestParamInfo<FontCase> const& info) { return info.param.name; });

TEST(VizTextLoaderTest, InheritsItsColourWhateverItsFlagAndCopiesStringAndPlacement) {
    TarvexAuthoredVisuText record = TextRecord(u"Ø 12 ±0.1");
    record.rgb = {{10, 20, 30}};
    record.anchor = {1, 2, 3};
    record.direction = {0, 1, 0};
    record.normal = {-1, 0, 0};
    std::vector<TarvexVisuAttributes> stack = Stack({Attributes({}, 40), Attributes({}, 50)});
    TarvexVisuText const source = Make<TarvexVisuText>(record);
    VizTextLoader loader(source, &stack, false);
    std::unique_ptr<VizText> const text = LoadAs<VizText>(loader);
    ASSERT_TRUE(text);
    EXPECT_EQ(text->GetColor(), RGBAColor(10, 20, 30, 50));
    EXPECT_EQ(text->GetText(), u"Ø 12 ±0.1");
    auto const triple = [](float const* v) { return std::vector<float>(v, v + 3); };
    EXPECT_EQ(triple(text->GetAnchorPoint()), (std::vector<float>{1, 2, 3}));
    EXPECT_EQ(triple(text->GetDirection()), (std::vector<float>{0, 1, 0}));
    EXPECT_EQ(triple(text->GetNormal()), (std::vector<float>{-1, 0, 0}));

    TarvexVisuText const uncoloured = Make<TarvexVisuText>(TextRecord(u"y"));
    VizTextLoader alone(uncoloured, nullptr, true);
    std::unique_ptr<VizText> const plain = LoadAs<VizText>(alone);
    ASSERT_TRUE(plain);
    EXPECT_FALSE(plain->HasColor());
}

/// What a text builder gave: strokes with and without index arrays, and faces.
struct BuiltCase {
    char const* name;
    int strokes, strokesWithoutIndices, faces;
    bool made;
};

class TesselateTextTest : public ::testing::TestWithParam<BuiltCase> {};

TEST_P(TesselateTextTest, SucceedsWithAnyPieceAndHandsOverNothingOtherwise) {
    BuiltCase const& c = GetParam();
    auto strokes = std::make_shared<std::vector<TarvexAuthoredVisuEdge>>(
        std::size_t(c.strokes + c.strokesWithoutIndices));
    for (int i = 0; i < c.strokes; ++i)
        (*strokes)[std::size_t(i)].lineIndices = std::vector<int>{};
    auto faces = std::make_shared<std::vector<TarvexAuthoredVisuFace>>(std::size_t(c.faces));
    std::vector<VizEdge*> edges;
    std::vector<VizFace*> filled;
    bool const made = VizBridgeTarvex::tesselateText(
        [&] { return TarvexVisuBuild2DTextResult(TarvexVisuContext(), strokes, faces); }, nullptr,
        edges, filled);
    std::vector<std::unique_ptr<VizEdge>> const ownedEdges(edges.begin(), edges.end());
    std::vector<std::unique_ptr<VizFace>> const ownedFaces(filled.begin(), filled.end());
    EXPECT_EQ(made, c.made);
    EXPECT_EQ(edges.size(), c.made ? std::size_t(c.strokes) : 0u);
    EXPECT_EQ(filled.size(), c.made ? std::size_t(c.faces) : 0u);
}

INSTANTIATE_TEST_SUITE_P(Cases, TesselateTextTest,
                         ::testing::Values(BuiltCase{"StrokesOnly", 2, 1, 0, true},
                                           BuiltCase{"FacesOnly", 0, 0, 3, true},
                                           BuiltCase{"Nothing", 0, 0, 0, false},
                                           BuiltCase{"EveryStrokeLoadsNothing", 0, 2, 0, false}),
                         [](::testing::TestParamInfo<BuiltCase> const& info) {
                             return info.param.name;
                         });

} // namespace

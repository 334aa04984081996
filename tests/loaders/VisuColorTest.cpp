#include "LoaderTestSupport.h"

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/loaders/VisuColor.h>

#include <gtest/gtest.h>

#include <array>
#include <vector>

namespace {

using namespace LoaderTest;
using KolbaVizCore::RGBAColor;

template <class Record> struct SourceOf;
template <> struct SourceOf<TarvexAuthoredVisuEdge> { using Type = TarvexVisuEdge; };
template <> struct SourceOf<TarvexAuthoredVisuFace> { using Type = TarvexVisuFace; };
template <> struct SourceOf<TarvexAuthoredVisuPoints> { using Type = TarvexVisuPoints; };
template <> struct SourceOf<TarvexAuthoredVisuText> { using Type = TarvexVisuText; };

struct ColorCase {
    Rgb rgb;
    Alpha alpha;
    std::vector<TarvexAuthoredVisuAttributes> stack; ///< oldest first
    bool inherit;
    bool nullStack;
    Rgb foundRgb; ///< neither found: no colour at all
    Alpha foundAlpha;
};

using A = std::array<unsigned short, 3>;
std::vector<ColorCase> const kCases = {
    // Own values win over the stack.
    {A{10, 20, 30}, 40, {Attributes(A{1, 2, 3}, 4)}, true, false, A{10, 20, 30}, 40},
    // Alpha from the newest entry that has one; the colour of that entry is not looked at.
    {A{10, 20, 30},
     {},
     {Attributes(A{1, 2, 3}, 50), Attributes(A{4, 5, 6}, 60), Attributes(A{7, 8, 9}, {})},
     true,
     false,
     A{10, 20, 30},
     60},
    // Colour and alpha from different entries.
    {{},
     {},
     {Attributes(A{1, 2, 3}, 50), Attributes(A{4, 5, 6}, {}), Attributes({}, {})},
     true,
     false,
     A{4, 5, 6},
     50},
    {{}, 70, {Attributes(A{4, 5, 6}, 9)}, true, false, A{4, 5, 6}, 70},
    // Without inheritance what is missing keeps the default's bytes.
    {{}, 70, {Attributes(A{4, 5, 6}, 9)}, false, false, {}, 70},
    {A{10, 20, 30}, {}, {Attributes({}, 9)}, false, false, A{10, 20, 30}, {}},
    {{}, {}, {Attributes(A{4, 5, 6}, 9)}, false, false, {}, {}},
    {{}, {}, {}, true, true, {}, {}},
    {{}, {}, {Attributes({}, {}), Attributes({}, {})}, true, false, {}, {}},
    // Each channel enters by its low byte.
    {A{0x1FF, 0x100, 0x1234}, 0x180, {}, false, false, A{0xFF, 0x00, 0x34}, 0x80},
};

template <class Record> class VisuColorTest : public ::testing::Test {};
using Records = ::testing::Types<TarvexAuthoredVisuEdge, TarvexAuthoredVisuFace,
                                 TarvexAuthoredVisuPoints, TarvexAuthoredVisuText>;
TYPED_TEST_SUITE(VisuColorTest, Records);

TYPED_TEST(VisuColorTest, FindsColourAndAlphaIndependently) {
    for (std::size_t i = 0; i < kCases.size(); ++i) {
        SCOPED_TRACE(i);
        ColorCase const& c = kCases[i];
        TypeParam record;
        record.rgb = c.rgb;
        record.alpha = c.alpha;
        auto const source = Make<typename SourceOf<TypeParam>::Type>(record);
        std::vector<TarvexVisuAttributes> stack = Stack(c.stack);
        RGBAColor const untouched(1, 2, 3, 4);
        RGBAColor color = untouched;
        bool const found = VizBridgeTarvex::resolveVisuColor(source, c.nullStack ? nullptr : &stack,
                                                             color, c.inherit);
        bool const expected = c.foundRgb || c.foundAlpha;
        EXPECT_EQ(found, expected);
        EXPECT_EQ(color, expected ? Found(c.foundRgb, c.foundAlpha) : untouched);
    }
}

} // namespace

#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexGlyphSource.h>
#include <VizBridge/contracts/tarvex/TarvexPolygonTriangulator.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <ostream>
#include <string>
#include <vector>

namespace {

using Point = TarvexPolygonTriangulator::Point;
using Contour = TarvexPolygonTriangulator::Contour;
using Triangulation = TarvexPolygonTriangulator::Triangulation;

double TwiceArea(Point const& a, Point const& b, Point const& c) {
    return (b[0] - a[0]) * (c[1] - a[1]) - (b[1] - a[1]) * (c[0] - a[0]);
}

bool EvenOddInside(std::vector<Contour> const& contours, Point const& p) {
    bool inside = false;
    for (Contour const& contour : contours) {
        for (std::size_t i = 0, j = contour.size() - 1; i < contour.size(); j = i++) {
            Point const& a = contour[i];
            Point const& b = contour[j];
            if ((a[1] > p[1]) != (b[1] > p[1]) &&
                p[0] < (b[0] - a[0]) * (p[1] - a[1]) / (b[1] - a[1]) + a[0]) {
                inside = !inside;
            }
        }
    }
    return inside;
}

/// Checks that the triangles turn counter-clockwise, cover every sample point of the region
/// exactly once and no point outside it, and returns their total area.
double CheckCoverage(std::vector<Contour> const& contours, Triangulation const& result) {
    double low[2] = {1e300, 1e300}, high[2] = {-1e300, -1e300};
    for (Contour const& contour : contours) {
        for (Point const& p : contour) {
            for (int axis = 0; axis < 2; ++axis) {
                low[axis] = std::min(low[axis], p[axis]);
                high[axis] = std::max(high[axis], p[axis]);
            }
        }
    }
    double area = 0;
    for (auto const& t : result.triangles) {
        double const twice =
            TwiceArea(result.points[t[0]], result.points[t[1]], result.points[t[2]]);
        EXPECT_GT(twice, 0) << "a triangle turns clockwise or has no area";
        area += twice / 2;
    }
    // Samples at irrational offsets never fall on an edge of these shapes.
    int const steps = 41;
    int wrong = 0;
    for (int i = 0; i < steps; ++i) {
        for (int j = 0; j < steps; ++j) {
            Point const p{low[0] + (high[0] - low[0]) * (i + 0.5 / std::sqrt(2.0)) / steps,
                          low[1] + (high[1] - low[1]) * (j + 0.5 / std::sqrt(3.0)) / steps};
            int covering = 0;
            for (auto const& t : result.triangles) {
                Point const& a = result.points[t[0]];
                Point const& b = result.points[t[1]];
                Point const& c = result.points[t[2]];
                if (TwiceArea(a, b, p) > 0 && TwiceArea(b, c, p) > 0 && TwiceArea(c, a, p) > 0) {
                    ++covering;
                }
            }
            if (covering != (EvenOddInside(contours, p) ? 1 : 0)) {
                ++wrong;
            }
        }
    }
    EXPECT_EQ(wrong, 0) << "sample points covered wrongly";
    return area;
}

Contour Rectangle(double x0, double y0, double x1, double y1) {
    return {{x0, y0}, {x1, y0}, {x1, y1}, {x0, y1}};
}

Contour Reversed(Contour contour) {
    std::reverse(contour.begin(), contour.end());
    return contour;
}

struct ShapeCase {
    char const* name;
    std::vector<Contour> contours;
    double area;
};

void PrintTo(ShapeCase const& c, std::ostream* os) {
    *os << c.name;
}

Contour Star() {
    Contour star;
    for (int i = 0; i < 10; ++i) {
        double const radius = i % 2 == 0 ? 10 : 4;
        double const angle = i * 3.14159265358979 / 5;
        star.push_back({radius * std::cos(angle), radius * std::sin(angle)});
    }
    return star;
}

double StarArea() {
    Contour const star = Star();
    return TarvexPolygonTriangulator::SignedArea(star);
}

class TarvexTriangulatorShapeTest : public ::testing::TestWithParam<ShapeCase> {};

TEST_P(TarvexTriangulatorShapeTest, FillsExactlyTheEnclosedRegion) {
    Triangulation const result = TarvexPolygonTriangulator::Triangulate(GetParam().contours);
    EXPECT_NEAR(CheckCoverage(GetParam().contours, result), GetParam().area, 1e-9);
}

INSTANTIATE_TEST_SUITE_P(
    Shapes, TarvexTriangulatorShapeTest,
    ::testing::Values(
        ShapeCase{"Square", {Rectangle(0, 0, 4, 4)}, 16},
        ShapeCase{"ClockwiseSquare", {Reversed(Rectangle(0, 0, 4, 4))}, 16},
        ShapeCase{"Comb",
                  {{{0, 0},
                    {5, 0},
                    {5, 1},
                    {1, 1},
                    {1, 2},
                    {5, 2},
                    {5, 3},
                    {1, 3},
                    {1, 4},
                    {5, 4},
                    {5, 5},
                    {0, 5}}},
                  17},
        ShapeCase{"RepeatedAndCollinearPoints",
                  {{{0, 0}, {2, 0}, {4, 0}, {4, 4}, {4, 4}, {0, 4}, {0, 0}}},
                  16},
        ShapeCase{"SquareWithHole", {Rectangle(0, 0, 10, 10), Rectangle(3, 3, 7, 7)}, 84},
        ShapeCase{"HoleRunningTheSameWay",
                  {Rectangle(0, 0, 10, 10), Reversed(Rectangle(3, 3, 7, 7))},
                  84},
        ShapeCase{"TwoHolesSideBySide",
                  {Rectangle(0, 0, 10, 4), Rectangle(1, 1, 4, 3), Rectangle(6, 1, 9, 3)},
                  28},
        ShapeCase{"TwoHolesInARow", // the bridge of the left hole must pass the right one
                  {Rectangle(0, 0, 12, 6), Rectangle(1, 2, 3, 4), Rectangle(5, 1, 7, 5)},
                  60},
        ShapeCase{"IslandInAHole",
                  {Rectangle(0, 0, 10, 10), Rectangle(2, 2, 8, 8), Rectangle(4, 4, 6, 6)},
                  68},
        ShapeCase{"TwoSeparateParts", {Rectangle(0, 0, 1, 1), Rectangle(2, 0, 4, 1)}, 3},
        ShapeCase{"Star", {Star()}, StarArea()}),
    [](::testing::TestParamInfo<ShapeCase> const& info) { return info.param.name; });

TEST(TarvexTriangulatorTest, NothingToFillGivesNoTriangles) {
    EXPECT_TRUE(TarvexPolygonTriangulator::Triangulate({}).triangles.empty());
    EXPECT_TRUE(TarvexPolygonTriangulator::Triangulate({{{0, 0}, {1, 1}}}).triangles.empty());
    EXPECT_TRUE(
        TarvexPolygonTriangulator::Triangulate({{{0, 0}, {1, 1}, {2, 2}}}).triangles.empty());
}

/// Real glyph outlines: curves flattened into many points, holes, and several parts.
class TarvexTriangulatorGlyphTest : public ::testing::TestWithParam<char32_t> {};

TEST_P(TarvexTriangulatorGlyphTest, TrianglesAddUpToTheOutlineArea) {
    for (std::string const file : {"DejaVuSans.ttf", "DejaVuSerif-Bold.ttf"}) {
        TarvexGlyphSource source(std::string(TarvexFontCache::kDefaultDirectory) + "/" + file);
        std::vector<Contour> const& contours = source.GetGlyph(GetParam()).contours;
        ASSERT_FALSE(contours.empty());
        // TrueType outlines run one way round filled parts and the other round holes, so the
        // signed areas sum to the filled area, whatever the triangulator makes of them.
        double outlineArea = 0;
        for (Contour const& contour : contours) {
            outlineArea += TarvexPolygonTriangulator::SignedArea(contour);
        }
        double const area =
            CheckCoverage(contours, TarvexPolygonTriangulator::Triangulate(contours));
        EXPECT_NEAR(area, std::abs(outlineArea), 1e-6 * std::abs(outlineArea)) << file;
    }
}

INSTANTIATE_TEST_SUITE_P(Glyphs, TarvexTriangulatorGlyphTest,
                         ::testing::Values(U'O', U'8', U'A', U'l', U'B', U'%', U'@', U'\u00e9',
                                           U'g', U'\u00d8'),
                         [](::testing::TestParamInfo<char32_t> const& info) {
                             return "U" + std::to_string(static_cast<unsigned>(info.param));
                         });

} // namespace

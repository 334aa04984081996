#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexGlyphSource.h>
#include <VizBridge/contracts/tarvex/TarvexPolygonTriangulator.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace {

using Triangulator = TarvexPolygonTriangulator;
using Point = Triangulator::Point;
using Contour = Triangulator::Contour;

double TwiceArea(Point const& a, Point const& b, Point const& c) {
    return (b[0] - a[0]) * (c[1] - a[1]) - (b[1] - a[1]) * (c[0] - a[0]);
}

/// Triangulates the region; checks that the triangles turn counter-clockwise and cover every
/// sample point of the region, by the even-odd rule, exactly once and none outside it; gives
/// their total area.
double FilledArea(std::vector<Contour> const& contours) {
    Triangulator::Triangulation const result = Triangulator::Triangulate(contours);
    auto const corner = [&result](auto const& t, int k) { return result.points[t[k]]; };
    double area = 0;
    for (auto const& t : result.triangles) {
        EXPECT_GT(TwiceArea(corner(t, 0), corner(t, 1), corner(t, 2)), 0) << "turns clockwise";
        area += TwiceArea(corner(t, 0), corner(t, 1), corner(t, 2)) / 2;
    }
    Point low{1e300, 1e300}, high{-1e300, -1e300};
    for (Contour const& contour : contours) {
        for (Point const& p : contour) {
            low = {std::min(low[0], p[0]), std::min(low[1], p[1])};
            high = {std::max(high[0], p[0]), std::max(high[1], p[1])};
        }
    }
    // Samples at irrational offsets never fall on an edge of these shapes.
    int wrong = 0;
    for (double i = 1 / std::sqrt(8.0); i < 41; ++i) {
        for (double j = 1 / std::sqrt(12.0); j < 41; ++j) {
            Point const p{low[0] + (high[0] - low[0]) * i / 41,
                          low[1] + (high[1] - low[1]) * j / 41};
            int covering = 0;
            for (auto const& t : result.triangles) {
                covering += TwiceArea(corner(t, 0), corner(t, 1), p) > 0 &&
                            TwiceArea(corner(t, 1), corner(t, 2), p) > 0 &&
                            TwiceArea(corner(t, 2), corner(t, 0), p) > 0;
            }
            bool inside = false;
            for (Contour const& c : contours) {
                for (std::size_t k = 0, l = c.size() - 1; k < c.size(); l = k++) {
                    inside ^= (c[k][1] > p[1]) != (c[l][1] > p[1]) &&
                              p[0] < (c[l][0] - c[k][0]) * (p[1] - c[k][1]) / (c[l][1] - c[k][1]) +
                                         c[k][0];
                }
            }
            wrong += covering != (inside ? 1 : 0);
        }
    }
    EXPECT_EQ(wrong, 0) << "sample points covered wrongly";
    return area;
}

/// A contour through the points x0, y0, x1, y1, ...
Contour Polygon(std::vector<double> const& xy) {
    Contour contour;
    for (std::size_t i = 0; i + 1 < xy.size(); i += 2) {
        contour.push_back({xy[i], xy[i + 1]});
    }
    return contour;
}

Contour Rectangle(double x0, double y0, double x1, double y1, bool clockwise = false) {
    return clockwise ? Polygon({x0, y0, x0, y1, x1, y1, x1, y0})
                     : Polygon({x0, y0, x1, y0, x1, y1, x0, y1});
}

TEST(TarvexTriangulatorTest, FillsExactlyTheEnclosedRegion) {
    std::pair<std::vector<Contour>, double> const cases[] = {
        {{Rectangle(0, 0, 4, 4)}, 16},
        {{Rectangle(0, 0, 4, 4, true)}, 16},
        // A comb, and a square with repeated and collinear points.
        {{Polygon({0, 0, 5, 0, 5, 1, 1, 1, 1, 2, 5, 2, 5, 3, 1, 3, 1, 4, 5, 4, 5, 5, 0, 5})}, 17},
        {{Polygon({0, 0, 2, 0, 4, 0, 4, 4, 4, 4, 0, 4, 0, 0})}, 16},
        // Holes running either way, side by side, in a row (the bridge of the left one must
        // pass the right one), with an island inside; and two separate parts.
        {{Rectangle(0, 0, 10, 10), Rectangle(3, 3, 7, 7)}, 84},
        {{Rectangle(0, 0, 10, 10), Rectangle(3, 3, 7, 7, true)}, 84},
        {{Rectangle(0, 0, 10, 4), Rectangle(1, 1, 4, 3), Rectangle(6, 1, 9, 3)}, 28},
        {{Rectangle(0, 0, 12, 6), Rectangle(1, 2, 3, 4), Rectangle(5, 1, 7, 5)}, 60},
        {{Rectangle(0, 0, 10, 10), Rectangle(2, 2, 8, 8), Rectangle(4, 4, 6, 6)}, 68},
        {{Rectangle(0, 0, 1, 1), Rectangle(2, 0, 4, 1)}, 3},
        // Nothing to fill.
        {{Polygon({0, 0, 1, 1})}, 0},
        {{Polygon({0, 0, 1, 1, 2, 2})}, 0},
    };
    for (auto const& [contours, area] : cases) {
        EXPECT_NEAR(FilledArea(contours), area, 1e-9) << contours.size() << " contours, " << area;
    }
    EXPECT_TRUE(Triangulator::Triangulate({}).triangles.empty());
}

// Real glyph outlines: curves flattened into many points, holes, and several parts. TrueType
// outlines run one way round filled parts and the other round holes, so their signed areas sum
// to the filled area.
TEST(TarvexTriangulatorTest, FillsGlyphOutlines) {
    for (std::string const file : {"DejaVuSans.ttf", "DejaVuSerif-Bold.ttf"}) {
        TarvexGlyphSource source(std::string(TarvexFontCache::kDefaultDirectory) + "/" + file);
        for (char32_t const glyph : std::u32string_view(U"O8AlB%@\u00e9g\u00d8")) {
            std::vector<Contour> const& contours = source.GetGlyph(glyph).contours;
            ASSERT_FALSE(contours.empty()) << file << " " << int(glyph);
            double outlineArea = 0;
            for (Contour const& contour : contours) {
                outlineArea += Triangulator::SignedArea(contour);
            }
            EXPECT_NEAR(FilledArea(contours), std::abs(outlineArea), 1e-6 * std::abs(outlineArea))
                << file << " " << int(glyph);
        }
    }
}

} // namespace

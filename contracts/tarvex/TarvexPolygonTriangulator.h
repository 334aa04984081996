#pragma once

#include <array>
#include <cstddef>
#include <vector>

/// Splits the region that closed contours enclose into triangles, by ear clipping after the
/// holes are bridged into the contours around them. The region is what the even-odd rule
/// fills: a contour inside one other is a hole, a contour inside a hole an island, and so on.
/// Contours may run either way round and may repeat their first point at the end; they must
/// not cross themselves or each other. Internal to the library; stateless.
class TarvexPolygonTriangulator {
public:
    using Point = std::array<double, 2>;
    using Contour = std::vector<Point>;

    struct Triangulation {
        std::vector<Point> points;
        /// Indices into `points`, each triangle counter-clockwise.
        std::vector<std::array<std::size_t, 3>> triangles;
    };

    static Triangulation Triangulate(std::vector<Contour> const& contours);

    /// Positive for a counter-clockwise contour.
    static double SignedArea(Contour const& contour);
};

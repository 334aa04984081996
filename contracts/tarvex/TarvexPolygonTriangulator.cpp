#include <VizBridge/contracts/tarvex/TarvexPolygonTriangulator.h>

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

using Point = TarvexPolygonTriangulator::Point;
using Contour = TarvexPolygonTriangulator::Contour;

/// Twice the signed area of (o, a, b): positive when the three turn left.
double cross(Point const& o, Point const& a, Point const& b) {
    return (a[0] - o[0]) * (b[1] - o[1]) - (a[1] - o[1]) * (b[0] - o[0]);
}

/// Inside or on the border of the counter-clockwise triangle (a, b, c).
bool inTriangle(Point const& a, Point const& b, Point const& c, Point const& p) {
    return cross(a, b, p) >= 0 && cross(b, c, p) >= 0 && cross(c, a, p) >= 0;
}

/// Whether the interiors of the segments (a, b) and (c, d) cross in one point.
bool crossProperly(Point const& a, Point const& b, Point const& c, Point const& d) {
    double const o1 = cross(a, b, c);
    double const o2 = cross(a, b, d);
    double const o3 = cross(c, d, a);
    double const o4 = cross(c, d, b);
    return ((o1 > 0 && o2 < 0) || (o1 < 0 && o2 > 0)) && ((o3 > 0 && o4 < 0) || (o3 < 0 && o4 > 0));
}

/// Even-odd containment of `p` in `contour`.
bool contains(Contour const& contour, Point const& p) {
    bool inside = false;
    for (std::size_t i = 0, j = contour.size() - 1; i < contour.size(); j = i++) {
        Point const& a = contour[i];
        Point const& b = contour[j];
        if ((a[1] > p[1]) != (b[1] > p[1]) &&
            p[0] < (b[0] - a[0]) * (p[1] - a[1]) / (b[1] - a[1]) + a[0]) {
            inside = !inside;
        }
    }
    return inside;
}

/// Drops repeated points, the closing repetition of the first included, and points on the
/// straight line between their neighbours; empty when nothing with an area is left.
Contour cleaned(Contour contour) {
    bool changed = true;
    while (changed && contour.size() >= 3) {
        changed = false;
        for (std::size_t i = 0; i < contour.size() && contour.size() >= 3; ++i) {
            std::size_t const n = contour.size();
            Point const& previous = contour[(i + n - 1) % n];
            Point const& next = contour[(i + 1) % n];
            if (contour[i] == next || cross(previous, contour[i], next) == 0) {
                contour.erase(contour.begin() + static_cast<std::ptrdiff_t>(i));
                changed = true;
            }
        }
    }
    if (contour.size() < 3) {
        contour.clear();
    }
    return contour;
}

/// A closed ring of indices into the shared point list, counter-clockwise for the outer
/// boundary; bridged holes appear in it clockwise.
class Ring {
public:
    Ring(std::vector<Point> const& points, std::vector<std::size_t> indices)
        : m_points(points), m_indices(std::move(indices)) {}

    /// Joins the clockwise `hole` into the ring by a bridge from its rightmost point.
    bool Bridge(std::vector<std::size_t> const& hole) {
        std::size_t holeStart = 0;
        for (std::size_t i = 1; i < hole.size(); ++i) {
            if (at(hole[i])[0] > at(hole[holeStart])[0]) {
                holeStart = i;
            }
        }
        std::size_t const visible = findVisible(at(hole[holeStart]));
        if (visible == npos) {
            return false;
        }
        // The ring goes to the hole and comes back along the same bridge: P, M, ..., M, P.
        std::vector<std::size_t> joined;
        joined.reserve(m_indices.size() + hole.size() + 2);
        joined.insert(joined.end(), m_indices.begin(),
                      m_indices.begin() + static_cast<std::ptrdiff_t>(visible) + 1);
        for (std::size_t i = 0; i <= hole.size(); ++i) {
            joined.push_back(hole[(holeStart + i) % hole.size()]);
        }
        joined.push_back(m_indices[visible]);
        joined.insert(joined.end(), m_indices.begin() + static_cast<std::ptrdiff_t>(visible) + 1,
                      m_indices.end());
        m_indices = std::move(joined);
        return true;
    }

    std::vector<std::size_t> const& Indices() const { return m_indices; }

private:
    static constexpr std::size_t npos = std::numeric_limits<std::size_t>::max();

    Point const& at(std::size_t index) const { return m_points[index]; }
    Point const& vertex(std::size_t position) const { return at(m_indices[position]); }
    std::size_t next(std::size_t position) const { return (position + 1) % m_indices.size(); }
    std::size_t previous(std::size_t position) const {
        return (position + m_indices.size() - 1) % m_indices.size();
    }

    /// Whether the direction from the ring's vertex at `position` towards `target` enters the
    /// inside of the ring there; tells apart the copies of a vertex an earlier bridge made.
    bool entersInside(std::size_t position, Point const& target) const {
        Point const& a = vertex(position);
        Point const& p = vertex(previous(position));
        Point const& n = vertex(next(position));
        if (cross(p, a, n) >= 0) {
            return cross(a, n, target) >= 0 && cross(a, target, p) >= 0;
        }
        return !(cross(a, p, target) > 0 && cross(a, target, n) > 0);
    }

    /// The position of a ring vertex that `m` sees without crossing the ring: cast a ray to
    /// +x, take the nearest crossing, and the end of the crossed edge furthest along; if a
    /// reflex vertex stands in the triangle between, the one closest in angle to the ray.
    std::size_t findVisible(Point const& m) const {
        double nearest = std::numeric_limits<double>::infinity();
        std::size_t candidate = npos;
        for (std::size_t i = 0; i < m_indices.size(); ++i) {
            Point const& a = vertex(i);
            Point const& b = vertex(next(i));
            if (a[1] == b[1]) {
                // An edge on the ray: its nearer end is hit first.
                if (a[1] == m[1]) {
                    for (std::size_t const end : {i, next(i)}) {
                        double const x = vertex(end)[0];
                        if (x >= m[0] && x < nearest) {
                            nearest = x;
                            candidate = end;
                        }
                    }
                }
                continue;
            }
            if (std::min(a[1], b[1]) > m[1] || std::max(a[1], b[1]) < m[1]) {
                continue;
            }
            double const x = a[0] + (m[1] - a[1]) * (b[0] - a[0]) / (b[1] - a[1]);
            if (x < m[0] || x >= nearest) {
                continue;
            }
            nearest = x;
            // A ray through a vertex sees that vertex; otherwise the edge's end further right
            // is the one to try.
            if (a[1] == m[1]) {
                candidate = i;
            } else if (b[1] == m[1]) {
                candidate = next(i);
            } else {
                candidate = a[0] > b[0] ? i : next(i);
            }
        }
        if (candidate == npos) {
            return npos;
        }
        Point const hit{nearest, m[1]};
        Point const p = vertex(candidate);
        std::size_t best = candidate;
        if (p != hit) {
            // (m, hit, p) turned counter-clockwise, whichever side of the ray p lies.
            Point const& b = p[1] < m[1] ? p : hit;
            Point const& c = p[1] < m[1] ? hit : p;
            double bestTangent = std::numeric_limits<double>::infinity();
            double bestDistance = std::numeric_limits<double>::infinity();
            for (std::size_t i = 0; i < m_indices.size(); ++i) {
                Point const& r = vertex(i);
                if (r == p || r[0] < m[0] || !inTriangle(m, b, c, r)) {
                    continue;
                }
                if (cross(vertex(previous(i)), r, vertex(next(i))) >= 0) {
                    continue;
                }
                double const dx = r[0] - m[0];
                double const tangent =
                    dx == 0 ? std::numeric_limits<double>::infinity() : std::abs(r[1] - m[1]) / dx;
                double const distance = dx * dx + (r[1] - m[1]) * (r[1] - m[1]);
                if (tangent < bestTangent || (tangent == bestTangent && distance < bestDistance)) {
                    bestTangent = tangent;
                    bestDistance = distance;
                    best = i;
                }
            }
        }
        // An earlier bridge may have copied the chosen vertex: take the copy that m lies in
        // front of.
        Point const chosen = vertex(best);
        for (std::size_t i = 0; i < m_indices.size(); ++i) {
            if (vertex(i) == chosen && entersInside(i, m)) {
                return i;
            }
        }
        return best;
    }

    std::vector<Point> const& m_points;
    std::vector<std::size_t> m_indices;
};

/// Clips ears off a ring of point indices until one triangle is left.
class EarClipper {
public:
    EarClipper(std::vector<Point> const& points, std::vector<std::size_t> const& ring)
        : m_points(points), m_ring(ring), m_next(ring.size()), m_previous(ring.size()),
          m_twinned(ring.size(), false) {
        for (std::size_t i = 0; i < ring.size(); ++i) {
            m_next[i] = (i + 1) % ring.size();
            m_previous[i] = (i + ring.size() - 1) % ring.size();
        }
        m_remaining = ring.size();
        // Bridges copy vertices; only at such a copy can an edge cross a cut that no vertex
        // blocks, so only there is the dearer test needed.
        std::vector<std::size_t> order(ring.size());
        for (std::size_t i = 0; i < order.size(); ++i) {
            order[i] = i;
        }
        std::sort(order.begin(), order.end(),
                  [this](std::size_t a, std::size_t b) { return at(a) < at(b); });
        for (std::size_t i = 1; i < order.size(); ++i) {
            if (at(order[i]) == at(order[i - 1])) {
                m_twinned[order[i]] = true;
                m_twinned[order[i - 1]] = true;
            }
        }
    }

    void Clip(std::vector<std::array<std::size_t, 3>>& triangles) {
        std::size_t current = 0;
        std::size_t failures = 0;
        while (m_remaining > 3) {
            if (isEar(current)) {
                std::size_t const following = m_next[current];
                emit(current, triangles);
                remove(current);
                current = following;
                failures = 0;
                continue;
            }
            current = m_next[current];
            if (++failures < m_remaining) {
                continue;
            }
            // A whole round without an ear: rounding or touching contours. First drop
            // corners without area, then, as a last resort, cut a convex corner regardless.
            failures = 0;
            if (removeFlatCorner(current)) {
                continue;
            }
            std::size_t const corner = findConvex(current);
            if (corner != npos) {
                emit(corner, triangles);
                current = m_next[corner];
                remove(corner);
            } else {
                std::size_t const following = m_next[current];
                remove(current);
                current = following;
            }
        }
        if (m_remaining == 3 &&
            cross(at(m_previous[current]), at(current), at(m_next[current])) > 0) {
            emit(current, triangles);
        }
    }

private:
    static constexpr std::size_t npos = std::numeric_limits<std::size_t>::max();

    Point const& at(std::size_t position) const { return m_points[m_ring[position]]; }

    bool isEar(std::size_t position) const {
        std::size_t const before = m_previous[position];
        std::size_t const after = m_next[position];
        Point const& a = at(before);
        Point const& b = at(position);
        Point const& c = at(after);
        if (cross(a, b, c) <= 0) {
            return false;
        }
        // Only a reflex or flat corner inside can make the cut leave the polygon; copies of
        // the ear's own corners, made by bridges, do not count.
        for (std::size_t other = m_next[after]; other != before; other = m_next[other]) {
            Point const& p = at(other);
            if (p == a || p == b || p == c || !inTriangle(a, b, c, p)) {
                continue;
            }
            if (cross(at(m_previous[other]), p, at(m_next[other])) <= 0) {
                return false;
            }
        }
        // Around bridges an edge may leave a copy of the tip and cross the cut.
        if (!m_twinned[position]) {
            return true;
        }
        for (std::size_t other = after; other != before; other = m_next[other]) {
            if (crossProperly(a, c, at(other), at(m_next[other]))) {
                return false;
            }
        }
        return true;
    }

    bool removeFlatCorner(std::size_t start) {
        std::size_t position = start;
        for (std::size_t step = 0; step < m_remaining; ++step) {
            Point const& p = at(m_previous[position]);
            Point const& q = at(position);
            Point const& r = at(m_next[position]);
            if (q == r || cross(p, q, r) == 0) {
                remove(position);
                return true;
            }
            position = m_next[position];
        }
        return false;
    }

    std::size_t findConvex(std::size_t start) const {
        std::size_t position = start;
        for (std::size_t step = 0; step < m_remaining; ++step) {
            if (cross(at(m_previous[position]), at(position), at(m_next[position])) > 0) {
                return position;
            }
            position = m_next[position];
        }
        return npos;
    }

    void emit(std::size_t position, std::vector<std::array<std::size_t, 3>>& triangles) const {
        triangles.push_back(
            {m_ring[m_previous[position]], m_ring[position], m_ring[m_next[position]]});
    }

    void remove(std::size_t position) {
        m_next[m_previous[position]] = m_next[position];
        m_previous[m_next[position]] = m_previous[position];
        --m_remaining;
    }

    std::vector<Point> const& m_points;
    std::vector<std::size_t> const& m_ring;
    std::vector<std::size_t> m_next;
    std::vector<std::size_t> m_previous;
    std::vector<bool> m_twinned; ///< by position: another position holds the same point
    std::size_t m_remaining = 0;
};

} // namespace

double TarvexPolygonTriangulator::SignedArea(Contour const& contour) {
    double twice = 0;
    for (std::size_t i = 0, j = contour.size() == 0 ? 0 : contour.size() - 1; i < contour.size();
         j = i++) {
        twice += contour[j][0] * contour[i][1] - contour[i][0] * contour[j][1];
    }
    return twice / 2;
}

TarvexPolygonTriangulator::Triangulation
TarvexPolygonTriangulator::Triangulate(std::vector<Contour> const& contours) {
    Triangulation result;
    std::vector<Contour> kept;
    for (Contour const& contour : contours) {
        Contour clean = cleaned(contour);
        if (!clean.empty()) {
            kept.push_back(std::move(clean));
        }
    }

    // Depth: how many other contours enclose a contour; even depths bound the region from
    // outside, odd depths are holes of the innermost enclosing contour.
    std::size_t const count = kept.size();
    std::vector<std::size_t> depth(count, 0);
    std::vector<double> area(count);
    for (std::size_t i = 0; i < count; ++i) {
        area[i] = SignedArea(kept[i]);
        for (std::size_t j = 0; j < count; ++j) {
            if (i != j && contains(kept[j], kept[i].front())) {
                ++depth[i];
            }
        }
    }
    std::vector<std::vector<std::size_t>> holesOf(count);
    for (std::size_t hole = 0; hole < count; ++hole) {
        if (depth[hole] % 2 == 0) {
            continue;
        }
        std::size_t parent = count;
        for (std::size_t j = 0; j < count; ++j) {
            if (depth[j] + 1 == depth[hole] && contains(kept[j], kept[hole].front()) &&
                (parent == count || std::abs(area[j]) < std::abs(area[parent]))) {
                parent = j;
            }
        }
        if (parent != count) {
            holesOf[parent].push_back(hole);
        }
    }

    // Every contour's points, turned the way its role asks: outer counter-clockwise, holes
    // clockwise.
    std::vector<std::vector<std::size_t>> indices(count);
    for (std::size_t i = 0; i < count; ++i) {
        bool const outer = depth[i] % 2 == 0;
        Contour contour = kept[i];
        if ((area[i] > 0) != outer) {
            std::reverse(contour.begin(), contour.end());
        }
        for (Point const& point : contour) {
            indices[i].push_back(result.points.size());
            result.points.push_back(point);
        }
    }

    for (std::size_t outer = 0; outer < count; ++outer) {
        if (depth[outer] % 2 != 0) {
            continue;
        }
        // Holes further right first, so that each bridge runs clear of those still to come.
        std::vector<std::size_t> holes = holesOf[outer];
        auto const rightmost = [&](std::size_t contour) {
            double x = -std::numeric_limits<double>::infinity();
            for (Point const& point : kept[contour]) {
                x = std::max(x, point[0]);
            }
            return x;
        };
        std::sort(holes.begin(), holes.end(),
                  [&](std::size_t a, std::size_t b) { return rightmost(a) > rightmost(b); });
        Ring ring(result.points, indices[outer]);
        for (std::size_t const hole : holes) {
            ring.Bridge(indices[hole]);
        }
        EarClipper(result.points, ring.Indices()).Clip(result.triangles);
    }
    return result;
}

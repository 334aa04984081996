#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <algorithm>
#include <cmath>
#include <sstream>

namespace KolbaVizCore {

namespace {

void subtract(double const* a, double const* b, double* out) {
    for (int axis = 0; axis < 3; ++axis)
        out[axis] = a[axis] - b[axis];
}

double dot(double const* a, double const* b) {
    return a[0] * b[0] + a[1] * b[1] + a[2] * b[2];
}

char const* typeWord(GeometryItem::Type type) {
    switch (type) {
    case GeometryItem::Type::Polygon:
        return "polygon";
    case GeometryItem::Type::Polyline:
        return "polyline";
    case GeometryItem::Type::LineSet:
        return "lineset";
    case GeometryItem::Type::Point:
        return "point";
    case GeometryItem::Type::Text:
        return "text";
    }
    return "item";
}

} // namespace

std::string GeometryItem::Describe() const {
    std::ostringstream text;
    text << typeWord(m_type) << '#' << m_tag;
    std::string const data = describeData();
    if (!data.empty())
        text << ' ' << data;
    if (m_hasColor) {
        text << " c=" << int{m_color.red} << ',' << int{m_color.green} << ',' << int{m_color.blue}
             << ',' << int{m_color.alpha};
    }
    return text.str();
}

void GeometryItem::addPointsToBox(std::vector<float> const& coordinates, Matrix4 const& world,
                                  VizBox& box) {
    for (std::size_t offset = 0; offset + 2 < coordinates.size(); offset += 3) {
        double point[3] = {coordinates[offset], coordinates[offset + 1], coordinates[offset + 2]};
        world.ApplyToPoint(point, point);
        box.Add(point);
    }
}

bool GeometryItem::IntersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                                double& t) const {
    // Written so that NaN, which fails every comparison, ends up as 0 too.
    return intersectRay(ray, world, tolerance > 0.0 ? tolerance : 0.0, t);
}

bool GeometryItem::intersectRay(Ray const&, Matrix4 const&, double, double&) const {
    return false;
}

bool GeometryItem::nearSegment(Ray const& ray, double const* start, double const* end,
                               double tolerance, double& t) {
    // The closest points of the ray origin + s * direction (s >= 0) and the segment
    // start + u * (end - start) (0 <= u <= 1): the distance between them is convex in s and u,
    // so clamping the free minimum to the allowed range, one parameter after the other,
    // finds the minimum within it.
    double const* const direction = ray.direction;
    double along[3];
    double offset[3];
    subtract(end, start, along);
    subtract(ray.origin, start, offset);
    double const rayLength2 = dot(direction, direction);
    if (!(rayLength2 > 0.0) || !std::isfinite(rayLength2))
        return false;
    double const segmentLength2 = dot(along, along);
    double const rayOffset = dot(direction, offset);
    double s = 0.0;
    double u = 0.0;
    if (segmentLength2 > 0.0) {
        double const cosine = dot(direction, along);
        double const segmentOffset = dot(along, offset);
        double const denominator = rayLength2 * segmentLength2 - cosine * cosine;
        // Parallel (relative to the lengths involved): any s serves, so start at the origin.
        if (denominator > 1e-12 * rayLength2 * segmentLength2)
            s = std::max(0.0, (cosine * segmentOffset - rayOffset * segmentLength2) / denominator);
        u = (cosine * s + segmentOffset) / segmentLength2;
        if (u < 0.0) {
            u = 0.0;
            s = std::max(0.0, -rayOffset / rayLength2);
        } else if (u > 1.0) {
            u = 1.0;
            s = std::max(0.0, (cosine - rayOffset) / rayLength2);
        }
    } else {
        s = std::max(0.0, -rayOffset / rayLength2);
    }
    // What lies at or behind the origin is not in front of the viewer.
    if (!(s > 0.0))
        return false;
    double gap2 = 0.0;
    for (int axis = 0; axis < 3; ++axis) {
        double const gap = ray.origin[axis] + s * direction[axis] - (start[axis] + u * along[axis]);
        gap2 += gap * gap;
    }
    if (gap2 > tolerance * tolerance)
        return false;
    t = s;
    return true;
}

bool GeometryItem::nearSegments(Ray const& ray, std::vector<float> const& coordinates,
                                std::size_t stride, Matrix4 const& world, double tolerance,
                                double& t) {
    std::size_t const pointCount = coordinates.size() / 3;
    bool found = false;
    double nearest = 0.0;
    for (std::size_t first = 0; first + 1 < pointCount; first += stride) {
        double ends[2][3];
        for (std::size_t end = 0; end < 2; ++end) {
            float const* const point = coordinates.data() + (first + end) * 3;
            double const local[3] = {point[0], point[1], point[2]};
            world.ApplyToPoint(local, ends[end]);
        }
        double hit = 0.0;
        if (nearSegment(ray, ends[0], ends[1], tolerance, hit) && (!found || hit < nearest)) {
            nearest = hit;
            found = true;
        }
    }
    if (found)
        t = nearest;
    return found;
}

bool GeometryItem::nearPoint(Ray const& ray, Matrix4 const& world, double const* local,
                             double tolerance, double& t) {
    double placed[3];
    world.ApplyToPoint(local, placed);
    return nearSegment(ray, placed, placed, tolerance, t);
}

} // namespace KolbaVizCore

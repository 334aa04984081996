#pragma once

#include <VizBridge/contracts/kolba/RGBAColor.h>

#include <cstddef>
#include <string>
#include <vector>

namespace KolbaVizCore {

class Matrix4;
class VizBox;
struct Ray;

/// One drawable piece of a scene node: a polygon, a polyline, a line set, a point or a text.
/// It has a type, the tag its renderer gave it, an optional colour and the data it was made
/// from, copied. Items are made by an AGeometryItemFactory and owned by the node that the
/// SceneBuilder adds them to.
class GeometryItem {
public:
    enum class Type { Polygon, Polyline, LineSet, Point, Text };

    GeometryItem(Type type, unsigned long tag) : m_type(type), m_tag(tag) {}
    GeometryItem(GeometryItem const&) = default;
    GeometryItem& operator=(GeometryItem const&) = default;
    virtual ~GeometryItem() = default;

    Type GetType() const { return m_type; }
    unsigned long GetTag() const { return m_tag; }

    void SetColor(RGBAColor const& color) {
        m_color = color;
        m_hasColor = true;
    }
    bool HasColor() const { return m_hasColor; }
    RGBAColor GetColor() const { return m_color; }

    /// One line of text for scene dumps, e.g. "polyline#4 pts=3 c=0,0,0,255".
    std::string Describe() const;

    /// Where `ray` (in world coordinates) first meets the item placed by `world`: true and
    /// the ray parameter `t` (the point origin + t * direction, t > 0); otherwise false and
    /// `t` untouched. Surfaces are met where the ray pierces them. Lines, points and texts
    /// have no area, so a ray that passes within `tolerance` (world units) of them meets them,
    /// and `t` is that of the ray's point nearest to them; nearest hits can so be compared
    /// across all kinds. A text counts as a point where it stands, its node's origin: without
    /// the font's glyphs its extent is unknown. A tolerance below 0, or not a number, is 0.
    bool IntersectRay(Ray const& ray, Matrix4 const& world, double tolerance, double& t) const;
    /// As above without tolerance: lines and points are met only where the ray touches them.
    bool IntersectRay(Ray const& ray, Matrix4 const& world, double& t) const {
        return IntersectRay(ray, world, 0.0, t);
    }

    /// Widens `box` by the item's points placed by `world`.
    virtual void AddToBox(Matrix4 const& world, VizBox& box) const = 0;

protected:
    /// Widens `box` by each point (three floats) of `coordinates`, placed by `world`.
    static void addPointsToBox(std::vector<float> const& coordinates, Matrix4 const& world,
                               VizBox& box);
    /// The type-specific part of Describe, after the type word and tag.
    virtual std::string describeData() const = 0;
    /// The type-specific part of IntersectRay; `tolerance` is 0 or more. The base is met by
    /// no ray.
    virtual bool intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                              double& t) const;
    /// Where `ray` passes within `tolerance` of the segment from `start` to `end` (world
    /// coordinates, three doubles each), as IntersectRay tells it. A segment of length 0 is
    /// its point.
    static bool nearSegment(Ray const& ray, double const* start, double const* end,
                            double tolerance, double& t);
    /// Where `ray` passes within `tolerance` of the segments between the points (three floats
    /// each) of `coordinates` placed by `world`: from point i to point i + 1 for every i that
    /// is a multiple of `stride` (1 for a line through all points, 2 for separate pairs).
    /// The nearest of them counts.
    static bool nearSegments(Ray const& ray, std::vector<float> const& coordinates,
                             std::size_t stride, Matrix4 const& world, double tolerance, double& t);
    /// Where `ray` passes within `tolerance` of `local` placed by `world`.
    static bool nearPoint(Ray const& ray, Matrix4 const& world, double const* local,
                          double tolerance, double& t);

private:
    Type m_type;
    unsigned long m_tag;
    bool m_hasColor = false;
    RGBAColor m_color;
};

} // namespace KolbaVizCore

#pragma once

#include <VizBridge/contracts/kolba/RGBAColor.h>

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
    /// the ray parameter `t` (hit = origin + t * direction, t > 0); otherwise false and `t`
    /// untouched. Only surfaces can be hit: lines, points and texts answer false.
    virtual bool IntersectRay(Ray const& ray, Matrix4 const& world, double& t) const;

    /// Widens `box` by the item's points placed by `world`.
    virtual void AddToBox(Matrix4 const& world, VizBox& box) const = 0;

protected:
    /// Widens `box` by each point (three floats) of `coordinates`, placed by `world`.
    static void addPointsToBox(std::vector<float> const& coordinates, Matrix4 const& world,
                               VizBox& box);
    /// The type-specific part of Describe, after the type word and tag.
    virtual std::string describeData() const = 0;

private:
    Type m_type;
    unsigned long m_tag;
    bool m_hasColor = false;
    RGBAColor m_color;
};

} // namespace KolbaVizCore

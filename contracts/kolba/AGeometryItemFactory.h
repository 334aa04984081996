#pragma once

#include <VizBridge/contracts/kolba/FontAttr.h>
#include <VizBridge/contracts/platform/WString.h>

namespace KolbaVizCore {

class GeometryItem;

/// Makes the geometry items that renderers add to scene nodes. Every Make operation copies
/// what it is given and hands out a new item that belongs to the caller (who normally passes
/// it on to SceneBuilder::AddGeometryItem), or null when the data cannot make an item.
/// Counts of coordinates count floats, three a point.
class AGeometryItemFactory {
public:
    AGeometryItemFactory() = default;
    AGeometryItemFactory(AGeometryItemFactory const&) = default;
    AGeometryItemFactory& operator=(AGeometryItemFactory const&) = default;
    virtual ~AGeometryItemFactory() = default;

    /// Triangles over `indexCount` indices, each a point number of `vertices`. `mode` is a
    /// TriangleType value from 1 to 3 (list, strip, fan). `normals` may be null with a count
    /// of 0.
    virtual GeometryItem* MakePolygon(unsigned long tag, float const* vertices,
                                      float const* normals, int const* indices,
                                      unsigned int vertexFloatCount, unsigned int normalFloatCount,
                                      unsigned int indexCount, int mode) = 0;
    /// A text; see TextItem for where it stands. `anchor` is three floats.
    virtual GeometryItem* MakeText(unsigned long tag, VizPort::WString const& text,
                                   VizPort::WString const& fontName, float const* anchor,
                                   FontAttr const& font, float angle) = 0;
    /// A line through the points in order.
    virtual GeometryItem* MakePolyline(unsigned long tag, float const* coordinates,
                                       unsigned int floatCount) = 0;
    /// One point.
    virtual GeometryItem* MakePoint(unsigned long tag, float x, float y, float z) = 0;
    /// Separate segments, one per pair of points.
    virtual GeometryItem* MakeLineSet(unsigned long tag, float const* coordinates,
                                      unsigned int floatCount) = 0;
};

} // namespace KolbaVizCore

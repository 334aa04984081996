#pragma once

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>

namespace KolbaVizCore {

/// The factory a SceneBuilder starts with. It makes PolygonItem, TextItem, PolylineItem,
/// PointItem and LineSetItem objects, and refuses (null) data that would make a broken one:
/// a missing array, a coordinate count that is not a multiple of 3, fewer than 2 points for
/// a line, fewer than 3 indices, an index outside the vertices, a normal array of another
/// size than the vertices', an unknown polygon mode.
class DefaultGeometryItemFactory : public AGeometryItemFactory {
public:
    GeometryItem* MakePolygon(unsigned long tag, float const* vertices, float const* normals,
                              int const* indices, unsigned int vertexFloatCount,
                              unsigned int normalFloatCount, unsigned int indexCount,
                              int mode) override;
    GeometryItem* MakeText(unsigned long tag, VizPort::WString const& text,
                           VizPort::WString const& fontName, float const* anchor,
                           FontAttr const& font, float angle) override;
    GeometryItem* MakePolyline(unsigned long tag, float const* coordinates,
                               unsigned int floatCount) override;
    GeometryItem* MakePoint(unsigned long tag, float x, float y, float z) override;
    GeometryItem* MakeLineSet(unsigned long tag, float const* coordinates,
                              unsigned int floatCount) override;
};

} // namespace KolbaVizCore

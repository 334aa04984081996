#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>

#include <VizBridge/contracts/kolba/LineSetItem.h>
#include <VizBridge/contracts/kolba/PointItem.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/PolylineItem.h>
#include <VizBridge/contracts/kolba/TextItem.h>
#include <VizBridge/contracts/kolba/TriangleType.h>

#include <algorithm>
#include <memory>
#include <vector>

namespace KolbaVizCore {

namespace {

bool isLine(float const* coordinates, unsigned int floatCount) {
    return coordinates != nullptr && floatCount % 3 == 0 && floatCount >= 6;
}

std::vector<float> copyOf(float const* values, unsigned int count) {
    return values == nullptr ? std::vector<float>() : std::vector<float>(values, values + count);
}

} // namespace

// Each Make hands its new item to the caller: the interface passes ownership as a raw pointer.

GeometryItem* DefaultGeometryItemFactory::MakePolygon(unsigned long tag, float const* vertices,
                                                      float const* normals, int const* indices,
                                                      unsigned int vertexFloatCount,
                                                      unsigned int normalFloatCount,
                                                      unsigned int indexCount, int mode) {
    if (vertices == nullptr || indices == nullptr || vertexFloatCount % 3 != 0 || indexCount < 3 ||
        mode < Triangles || mode > TriangleFan)
        return nullptr;
    if (normalFloatCount != 0 && (normals == nullptr || normalFloatCount != vertexFloatCount))
        return nullptr;
    long const pointCount = static_cast<long>(vertexFloatCount / 3);
    bool const inside = std::all_of(indices, indices + indexCount, [pointCount](int index) {
        return index >= 0 && index < pointCount;
    });
    if (!inside)
        return nullptr;
    return std::make_unique<PolygonItem>(tag, copyOf(vertices, vertexFloatCount),
                                         copyOf(normals, normalFloatCount),
                                         std::vector<int>(indices, indices + indexCount), mode)
        .release();
}

GeometryItem* DefaultGeometryItemFactory::MakeText(unsigned long tag, VizPort::WString const& text,
                                                   VizPort::WString const& fontName,
                                                   float const* anchor, FontAttr const& font,
                                                   float angle) {
    if (anchor == nullptr)
        return nullptr;
    return std::make_unique<TextItem>(tag, text, fontName,
                                      std::array<float, 3>{anchor[0], anchor[1], anchor[2]}, font,
                                      angle)
        .release();
}

GeometryItem* DefaultGeometryItemFactory::MakePolyline(unsigned long tag, float const* coordinates,
                                                       unsigned int floatCount) {
    if (!isLine(coordinates, floatCount))
        return nullptr;
    return std::make_unique<PolylineItem>(tag, copyOf(coordinates, floatCount)).release();
}

GeometryItem* DefaultGeometryItemFactory::MakePoint(unsigned long tag, float x, float y, float z) {
    return std::make_unique<PointItem>(tag, x, y, z).release();
}

GeometryItem* DefaultGeometryItemFactory::MakeLineSet(unsigned long tag, float const* coordinates,
                                                      unsigned int floatCount) {
    if (!isLine(coordinates, floatCount))
        return nullptr;
    return std::make_unique<LineSetItem>(tag, copyOf(coordinates, floatCount)).release();
}

} // namespace KolbaVizCore

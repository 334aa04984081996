#include <VizBridge/contracts/kolba/PolylineItem.h>

#include <utility>

namespace KolbaVizCore {

PolylineItem::PolylineItem(unsigned long tag, std::vector<float> coordinates)
    : GeometryItem(Type::Polyline, tag), m_coordinates(std::move(coordinates)) {}

void PolylineItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    addPointsToBox(m_coordinates, world, box);
}

std::string PolylineItem::describeData() const {
    return "pts=" + std::to_string(GetPointCount());
}

} // namespace KolbaVizCore

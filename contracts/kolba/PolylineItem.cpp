#include <VizBridge/contracts/kolba/PolylineItem.h>

#include <utility>

namespace KolbaVizCore {

PolylineItem::PolylineItem(unsigned long tag, std::vector<float> coordinates)
    : GeometryItem(Type::Polyline, tag), m_coordinates(std::move(coordinates)) {}

void PolylineItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    addPointsToBox(m_coordinates, world, box);
}

bool PolylineItem::intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                                double& t) const {
    // Stride 1: each point joins the next.
    return nearSegments(ray, m_coordinates, 1, world, tolerance, t);
}

std::string PolylineItem::describeData() const {
    return "pts=" + std::to_string(GetPointCount());
}

} // namespace KolbaVizCore

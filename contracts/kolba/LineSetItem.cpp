#include <VizBridge/contracts/kolba/LineSetItem.h>

#include <utility>

namespace KolbaVizCore {

LineSetItem::LineSetItem(unsigned long tag, std::vector<float> coordinates)
    : GeometryItem(Type::LineSet, tag), m_coordinates(std::move(coordinates)) {}

void LineSetItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    addPointsToBox(m_coordinates, world, box);
}

bool LineSetItem::intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                               double& t) const {
    // Stride 2: each pair of points is a segment of its own.
    return nearSegments(ray, m_coordinates, 2, world, tolerance, t);
}

std::string LineSetItem::describeData() const {
    return "pts=" + std::to_string(GetPointCount());
}

} // namespace KolbaVizCore

#include <VizBridge/contracts/kolba/PointItem.h>

#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <sstream>

namespace KolbaVizCore {

PointItem::PointItem(unsigned long tag, float x, float y, float z)
    : GeometryItem(Type::Point, tag), m_position{x, y, z} {}

void PointItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    double point[3] = {m_position[0], m_position[1], m_position[2]};
    world.ApplyToPoint(point, point);
    box.Add(point);
}

bool PointItem::intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                             double& t) const {
    double const local[3] = {m_position[0], m_position[1], m_position[2]};
    return nearPoint(ray, world, local, tolerance, t);
}

std::string PointItem::describeData() const {
    std::ostringstream text;
    text << "at=" << m_position[0] << ',' << m_position[1] << ',' << m_position[2];
    return text.str();
}

} // namespace KolbaVizCore

#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <sstream>

namespace KolbaVizCore {

namespace {

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

bool GeometryItem::IntersectRay(Ray const&, Matrix4 const&, double&) const {
    return false;
}

} // namespace KolbaVizCore

#include <VizBridge/contracts/kolba/TextItem.h>

#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <sstream>
#include <utility>

namespace KolbaVizCore {

TextItem::TextItem(unsigned long tag, VizPort::WString text, VizPort::WString fontName,
                   std::array<float, 3> const& anchor, FontAttr const& font, float angle)
    : GeometryItem(Type::Text, tag), m_text(std::move(text)), m_fontName(std::move(fontName)),
      m_anchor(anchor), m_font(font), m_angle(angle) {}

void TextItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    double point[3] = {0.0, 0.0, 0.0};
    world.ApplyToPoint(point, point);
    box.Add(point);
}

bool TextItem::intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                            double& t) const {
    // Where the text stands; see IntersectRay for why its glyphs do not count.
    double const origin[3] = {0.0, 0.0, 0.0};
    return nearPoint(ray, world, origin, tolerance, t);
}

std::string TextItem::describeData() const {
    std::ostringstream text;
    text << '"' << VizPort::Narrow(m_text) << "\" font=\"" << VizPort::Narrow(m_fontName)
         << "\" size=" << m_font.size;
    return text.str();
}

} // namespace KolbaVizCore

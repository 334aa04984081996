#pragma once

#include <VizBridge/contracts/kolba/FontAttr.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/platform/WString.h>

#include <array>

namespace KolbaVizCore {

/// A text set in a font. The text stands at the origin of the node that holds it, in the
/// node's x-y plane: the node's transformation places it, as a renderer puts the text's
/// anchor, direction and normal there. `anchor` keeps where that is in the coordinates of the
/// text's source, for hosts; it does not move the text again. `angle` turns the text within
/// its plane, in radians.
class TextItem : public GeometryItem {
public:
    TextItem(unsigned long tag, VizPort::WString text, VizPort::WString fontName,
             std::array<float, 3> const& anchor, FontAttr const& font, float angle);

    VizPort::WString GetText() const { return m_text; }
    VizPort::WString GetFontName() const { return m_fontName; }
    std::array<float, 3> const& GetAnchor() const { return m_anchor; }
    FontAttr GetFontAttr() const { return m_font; }
    float GetAngle() const { return m_angle; }

    /// Adds the place of the text: its node's origin.
    void AddToBox(Matrix4 const& world, VizBox& box) const override;

protected:
    std::string describeData() const override;
    bool intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                      double& t) const override;

private:
    VizPort::WString m_text;
    VizPort::WString m_fontName;
    std::array<float, 3> m_anchor;
    FontAttr m_font;
    float m_angle;
};

} // namespace KolbaVizCore

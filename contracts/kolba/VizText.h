#pragma once

#include <VizBridge/contracts/kolba/FontAttr.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>

namespace KolbaVizCore {

/// A text of a PMI: the string, its font, and where it stands: an anchor point, the
/// direction of its baseline and the normal of its plane (three floats each; by default the
/// origin, the x axis and the z axis). Font size, spacing and width scaling start at 1.
class VizText : public VizElement {
public:
    static std::string TypeID() { return "VizText"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetText(VizPort::WString const& text) { m_text = text; }
    VizPort::WString GetText() const { return m_text; }
    void SetFontName(VizPort::WString const& name) { m_fontName = name; }
    VizPort::WString GetFontName() const { return m_fontName; }

    void SetFontSize(float size) { m_font.size = size; }
    float GetFontSize() const { return m_font.size; }
    void SetSpacingFactor(float factor) { m_font.spacing = factor; }
    float GetSpacingFactor() const { return m_font.spacing; }
    void SetWidthScaling(float factor) { m_font.widthScaling = factor; }
    float GetWidthScaling() const { return m_font.widthScaling; }
    /// Size, spacing and width scaling together, as a text item is made with them.
    FontAttr GetFontAttrs() const { return m_font; }

    /// Each takes three floats; null leaves the value as it was.
    void SetAnchorPoint(float const* const point);
    void SetDirection(float const* const direction);
    void SetNormal(float const* const normal);
    /// Three floats each.
    float const* GetAnchorPoint() const { return m_anchor; }
    float const* GetDirection() const { return m_direction; }
    float const* GetNormal() const { return m_normal; }

    /// Makes the colour opaque: its alpha byte becomes 255. Whether the text has a colour
    /// of its own stays as it was.
    void RemoveTransparency();

private:
    VizPort::WString m_text;
    VizPort::WString m_fontName;
    FontAttr m_font;
    float m_anchor[3] = {0.0f, 0.0f, 0.0f};
    float m_direction[3] = {1.0f, 0.0f, 0.0f};
    float m_normal[3] = {0.0f, 0.0f, 1.0f};
};

} // namespace KolbaVizCore

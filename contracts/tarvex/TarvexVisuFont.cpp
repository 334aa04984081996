#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Font = TarvexAuthoredVisuFont;

TarvexWString TarvexVisuFont::GetFontName() const {
    Font const* const font = m_context.Read(m_record, "TarvexVisuFont::GetFontName");
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(font, &Font::name));
}

bool TarvexVisuFont::GetTextHeight(float& height) const {
    Font const* const font = m_context.Read(m_record, "TarvexVisuFont::GetTextHeight");
    return TarvexVisuValues::Number(TarvexVisuValues::Member(font, &Font::textHeight), height);
}

bool TarvexVisuFont::GetSpacingFactor(float& factor) const {
    Font const* const font = m_context.Read(m_record, "TarvexVisuFont::GetSpacingFactor");
    return TarvexVisuValues::Number(TarvexVisuValues::Member(font, &Font::spacingFactor), factor);
}

bool TarvexVisuFont::GetWidthScalingFactor(float& factor) const {
    Font const* const font = m_context.Read(m_record, "TarvexVisuFont::GetWidthScalingFactor");
    return TarvexVisuValues::Number(TarvexVisuValues::Member(font, &Font::widthScalingFactor),
                                    factor);
}

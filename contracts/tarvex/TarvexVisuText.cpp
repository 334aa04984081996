#include <VizBridge/contracts/tarvex/TarvexVisuText.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

#include <algorithm>
#include <array>
#include <utility>

using Text = TarvexAuthoredVisuText;

bool TarvexVisuText::GetFont(TarvexVisuFont& font) const {
    Text const* const text = m_context.Read(m_record, "TarvexVisuText::GetFont");
    if (text == nullptr || !text->font) {
        return false;
    }
    font = TarvexVisuFont(m_context,
                          std::shared_ptr<TarvexAuthoredVisuFont const>(m_record, &*text->font));
    return true;
}

TarvexWString TarvexVisuText::GetTextString(float* const anchor, float* const direction,
                                            float* const normal) const {
    Text const* const text = m_context.Read(m_record, "TarvexVisuText::GetTextString");
    // Callers hand the arrays on whatever the answer, so a missing text still fills them.
    static Text const unplaced;
    Text const& placement = text == nullptr ? unplaced : *text;
    std::pair<float*, std::array<float, 3> const*> const targets[] = {
        {anchor, &placement.anchor},
        {direction, &placement.direction},
        {normal, &placement.normal}};
    for (auto const& [target, source] : targets) {
        if (target != nullptr) {
            std::copy(source->begin(), source->end(), target);
        }
    }
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(text, &Text::text));
}

bool TarvexVisuText::GetRGBColor(unsigned short& red, unsigned short& green,
                                 unsigned short& blue) const {
    Text const* const text = m_context.Read(m_record, "TarvexVisuText::GetRGBColor");
    return TarvexVisuValues::Rgb(TarvexVisuValues::Member(text, &Text::rgb), red, green, blue);
}

bool TarvexVisuText::GetAlphaColor(unsigned short& alpha) const {
    Text const* const text = m_context.Read(m_record, "TarvexVisuText::GetAlphaColor");
    return TarvexVisuValues::Alpha(TarvexVisuValues::Member(text, &Text::alpha), alpha);
}

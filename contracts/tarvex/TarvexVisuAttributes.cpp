#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Attributes = TarvexAuthoredVisuAttributes;

bool TarvexVisuAttributes::GetHidden(bool& hidden) const {
    Attributes const* const attributes =
        m_context.Read(m_record, "TarvexVisuAttributes::GetHidden");
    return TarvexVisuValues::Flag(TarvexVisuValues::Member(attributes, &Attributes::hidden),
                                  hidden);
}

bool TarvexVisuAttributes::GetRGBColor(unsigned short& red, unsigned short& green,
                                       unsigned short& blue) const {
    Attributes const* const attributes =
        m_context.Read(m_record, "TarvexVisuAttributes::GetRGBColor");
    return TarvexVisuValues::Rgb(TarvexVisuValues::Member(attributes, &Attributes::rgb), red, green,
                                 blue);
}

bool TarvexVisuAttributes::GetAlphaColor(unsigned short& alpha) const {
    Attributes const* const attributes =
        m_context.Read(m_record, "TarvexVisuAttributes::GetAlphaColor");
    return TarvexVisuValues::Alpha(TarvexVisuValues::Member(attributes, &Attributes::alpha), alpha);
}

bool TarvexVisuAttributes::GetFont(TarvexVisuFont& font) const {
    Attributes const* const attributes = m_context.Read(m_record, "TarvexVisuAttributes::GetFont");
    if (attributes == nullptr || !attributes->font) {
        return false;
    }
    font = TarvexVisuFont(
        m_context, std::shared_ptr<TarvexAuthoredVisuFont const>(m_record, &*attributes->font));
    return true;
}

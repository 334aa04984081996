#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuText;

/// A text of a PMI: a string, where it stands, the direction along it and the normal that
/// faces its reader, possibly a font and a colour of its own. A default object has no text
/// and stands at the origin, running along x, facing z.
class TarvexVisuText {
public:
    TarvexVisuText() = default;
    TarvexVisuText(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuText const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// True and `font` filled when the text has a font of its own.
    bool GetFont(TarvexVisuFont& font) const;
    /// The string; fills the anchor, the direction and the normal, three floats each. Every
    /// array is filled, also when there is no string; a null array is passed over.
    TarvexWString GetTextString(float* const anchor, float* const direction,
                                float* const normal) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;

private:
    // The text builder reads the text without asking the fault plan of every getter, and
    // builds its geometry for the text's model.
    friend class TarvexVisu2DTextBuilder;

    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuText const> m_record; ///< shares the import's data
};

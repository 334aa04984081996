#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuFont;

/// A font of a text or of node attributes. The number getters leave their argument alone when
/// the font has no such value. A default object is a font without any value.
class TarvexVisuFont {
public:
    TarvexVisuFont() = default;
    TarvexVisuFont(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuFont const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// No text when the font has no name.
    TarvexWString GetFontName() const;
    bool GetTextHeight(float& height) const;
    bool GetSpacingFactor(float& factor) const;
    bool GetWidthScalingFactor(float& factor) const;

private:
    // The text builder reads the font without asking the fault plan of every getter.
    friend class TarvexVisu2DTextBuilder;

    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuFont const> m_record; ///< shares the import's data
};

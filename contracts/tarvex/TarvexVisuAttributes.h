#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>

#include <memory>

struct TarvexAuthoredVisuAttributes;

/// The attributes of a node: hidden state, colour, alpha and font, each possibly absent.
/// Getters of absent values answer false and leave their arguments alone. A default object
/// has no values.
class TarvexVisuAttributes {
public:
    TarvexVisuAttributes() = default;
    TarvexVisuAttributes(TarvexVisuContext context,
                         std::shared_ptr<TarvexAuthoredVisuAttributes const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetHidden(bool& hidden) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;
    bool GetFont(TarvexVisuFont& font) const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuAttributes const> m_record; ///< shares the import's data
};

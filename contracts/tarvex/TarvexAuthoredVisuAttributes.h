#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <array>
#include <optional>

/// A font as a host or test describes it. Every value may be absent.
struct TarvexAuthoredVisuFont {
    std::optional<VizPort::WString> name;
    std::optional<float> textHeight;         ///< the height of a capital letter
    std::optional<float> spacingFactor;      ///< scales the advance from one glyph to the next
    std::optional<float> widthScalingFactor; ///< scales glyphs and advances along the text
};

/// The attributes of a node of the visualisation data. Every value may be absent.
struct TarvexAuthoredVisuAttributes {
    std::optional<bool> hidden;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
    std::optional<TarvexAuthoredVisuFont> font;
};

#pragma once

#include <cstdint>

namespace KolbaVizCore {

/// Four colour bytes: red, green, blue, alpha. Default: opaque black.
struct RGBAColor {
    RGBAColor() = default;
    RGBAColor(std::uint8_t r, std::uint8_t g, std::uint8_t b, std::uint8_t a)
        : red(r), green(g), blue(b), alpha(a) {}

    bool operator==(RGBAColor const& o) const {
        return red == o.red && green == o.green && blue == o.blue && alpha == o.alpha;
    }
    bool operator!=(RGBAColor const& o) const { return !(*this == o); }

    std::uint8_t red = 0;
    std::uint8_t green = 0;
    std::uint8_t blue = 0;
    std::uint8_t alpha = 255;
};

} // namespace KolbaVizCore

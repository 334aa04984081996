#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <cstdint>

// How the system reads the plain values of the import library: its texts, its 16-bit colour
// channels and its counts.

namespace VizBridgeTarvex {

/// The text of `text` into `out`; false, and `out` untouched, when the import library gives
/// no text (a null pointer).
inline bool textOf(TarvexWString const& text, VizPort::WString& out) {
    char16_t const* characters = nullptr;
    text.ToWChar(characters);
    if (!characters)
        return false;
    out = characters;
    return true;
}

/// The text of `text`, empty when there is none.
inline VizPort::WString textOrEmpty(TarvexWString const& text) {
    VizPort::WString out;
    textOf(text, out);
    return out;
}

/// A 16-bit colour channel as a colour byte: its low 8 bits, unscaled.
inline std::uint8_t colorByte(unsigned short const channel) {
    return static_cast<std::uint8_t>(channel & 0xFFu);
}

/// A count of the import library as a size hint: a negative count hints nothing.
inline unsigned int countHint(int const count) {
    return count > 0 ? static_cast<unsigned int>(count) : 0u;
}

} // namespace VizBridgeTarvex

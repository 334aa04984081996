#pragma once

#include "contracts/tarvex/TarvexWString.h"
#include "model/VizTypes.h"

namespace VizBridgeTarvex {

/// The text of `text` into `out`; false, and `out` untouched, when the import library gives
/// no text (a null pointer).
inline bool textOf(TarvexWString const& text, WString& out) {
    char16_t const* characters = nullptr;
    text.ToWChar(characters);
    if (!characters)
        return false;
    out = characters;
    return true;
}

/// The text of `text`, empty when there is none.
inline WString textOrEmpty(TarvexWString const& text) {
    WString out;
    textOf(text, out);
    return out;
}

} // namespace VizBridgeTarvex

#pragma once

#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <optional>
#include <string>

/// The text of `text` as a reader sees it through ToWChar: absent when the pointer is null.
inline std::optional<std::u16string> TextOf(TarvexWString const& text) {
    char16_t const* characters = nullptr;
    bool const present = text.ToWChar(characters);
    if (present != (characters != nullptr)) {
        return u"<ToWChar answer disagrees with its pointer>";
    }
    return present ? std::optional<std::u16string>(characters) : std::nullopt;
}

#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <optional>

/// A 16-bit text that may be absent. A value object.
class TarvexWString {
public:
    TarvexWString() = default; ///< no text
    TarvexWString(char16_t const* text);
    TarvexWString(VizPort::WString text) : m_text(std::move(text)) {}
    TarvexWString(std::optional<VizPort::WString> text) : m_text(std::move(text)) {}

    /// Points `text` at the characters, valid while this object lives, or at null when
    /// there is no text. Answers whether there is one.
    bool ToWChar(char16_t const*& text) const;
    /// The text, empty when there is none.
    VizPort::WString ToWString() const { return m_text.value_or(VizPort::WString()); }
    bool HasText() const { return m_text.has_value(); }

private:
    std::optional<VizPort::WString> m_text;
};

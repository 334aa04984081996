#include <VizBridge/contracts/tarvex/TarvexWString.h>

TarvexWString::TarvexWString(char16_t const* text) {
    if (text != nullptr) {
        m_text.emplace(text);
    }
}

bool TarvexWString::ToWChar(char16_t const*& text) const {
    text = m_text ? m_text->c_str() : nullptr;
    return text != nullptr;
}

#pragma once

#include <string>

namespace VizPort {

/// The 16-bit text of every name and message. Windows' wchar_t text is 16 bits wide;
/// char16_t keeps that width on every platform.
using WString = std::u16string;

/// Widens bytes one to one (no code page): for exception texts and literals.
WString Widen(std::string const& bytes);

/// Narrows each 16-bit character to its low byte; characters above 0xFF become '?'.
std::string Narrow(WString const& text);

} // namespace VizPort

#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <cstddef>
#include <initializer_list>
#include <variant>

namespace VizPort {

/// One argument of FormatW. Texts are taken by pointer; a null text prints as nothing.
using FormatArg = std::variant<char16_t const*, int, unsigned long, double>;

/// The printf-style formatter of the system's 16-bit texts, as swprintf into a buffer of
/// `bufferSize` characters would write them: `%s` takes a 16-bit text, `%d` an int,
/// `%lu` an unsigned long, `%f` a double with six decimals, `%%` a percent sign.
/// Numbers print in the C locale whatever the process locale is.
///
/// A result that would not fit is cut to `bufferSize - 1` characters (room for the
/// terminator of a fixed buffer); it never overruns. A conversion whose argument is
/// missing or of another kind prints nothing, and an unknown conversion is copied as it
/// stands: formatting never throws on a bad format.
WString FormatW(std::size_t bufferSize, char16_t const* format,
                std::initializer_list<FormatArg> args);

} // namespace VizPort

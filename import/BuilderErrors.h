#pragma once

#include "model/VizTypes.h"

#include <exception>

namespace VizBridgeTarvex::BuilderErrors {

/// The size, in 16-bit characters with the terminator, of the buffer that every error
/// text is formatted into; longer texts are cut.
constexpr std::size_t kBufferSize = 1024;

/// Writes "Error on RefID <id>: <text>" to the debug output. Changes no data.
void reportDebugError(int const& id, WString const& text);

/// The stored text for a std::exception caught at `stage`: "Error on <stage> (RefID <id>) :
/// <what>", or, for a what() holding "Unhandled Exception", "<stage> (RefID <id>) Error :
/// <line>" with its second line if it has one, else the whole text.
void formatExceptionError(WString const& stage, int const& id, std::exception const& e,
                          WString& out);

/// "<stage> (RefID <id>) Error : <text>", for whatever was caught that is no std::exception.
void formatUnknownError(WString const& stage, int const& id, WString const& text, WString& out);

} // namespace VizBridgeTarvex::BuilderErrors

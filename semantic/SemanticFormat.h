#pragma once

#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <vector>

// The one place where the system turns the values of semantic records into text. Numbers
// print in the C locale, in fixed buffers: a text that would not fit is cut, never overrun.

namespace VizBridgeTarvex {

using VizPort::WString;

/// The characters of `text` up to the terminator; a text without characters (a null
/// pointer) gives an empty string.
WString ToWString(TarvexWString const& text);
/// "true" or "false".
WString FormatBool(bool value);
/// "%d".
WString FormatInt(int value);
/// Widened to double, then "%f": six digits behind the point, 1.5 gives "1.500000".
WString FormatFloat(float value);
/// "%f".
WString FormatDouble(double value);
/// A tuple of `count` values, "(1.000000, 2.500000)", in one buffer of 1024 characters.
/// Nothing to print (a count below 1 or no values) gives an empty string.
WString FormatFloats(int count, float const* values);
/// As FormatFloats, for doubles.
WString FormatDoubles(int count, double const* values);
/// "[parent id, type, id]", in the order of the EntityId constructor.
WString FormatEntityId(KolbaVizCore::EntityId entity);
/// The parts in order with `separator` between them; none gives an empty string.
WString JoinStrings(std::vector<WString> parts, WString separator);

} // namespace VizBridgeTarvex

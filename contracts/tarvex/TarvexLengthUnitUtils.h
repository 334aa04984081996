#pragma once

#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

/// Unit table:
///   value  name          text   metres
///   0      Unknown       (none) 1 (counts as the unit itself in every conversion)
///   1      Meter         "m"    1
///   2      Centimeter    "cm"   0.01
///   3      Inch          "in"   0.0254
///   4      Millimeter    "mm"   0.001
///   5      Foot          "ft"   0.3048
///   6      Micrometer    "um"   0.000001
///   7      Kilometer     "km"   1000
///   8      Yard          "yd"   0.9144
///   9      Mile          "mi"   1609.344
/// A value outside the table behaves as Unknown.
class TarvexLengthUnitUtils {
public:
    /// The unit's text; no text (ToWChar gives null) for Unknown and unlisted values.
    static TarvexWString LengthUnitToString(TarvexLengthUnitType unit);
    /// The factor that turns a length in `from` into a length in `to`; 1 when either is
    /// Unknown or unlisted.
    static double GetScalingFactor(TarvexLengthUnitType from, TarvexLengthUnitType to);
};

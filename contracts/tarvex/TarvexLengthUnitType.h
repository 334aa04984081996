#pragma once

/// Length units. The values are the library's interface: 0 says that the unit is not known.
enum TarvexLengthUnitType : int {
    TarvexLengthUnit_Unknown = 0,
    TarvexLengthUnit_Meter = 1,
    TarvexLengthUnit_Centimeter = 2,
    TarvexLengthUnit_Inch = 3,
    TarvexLengthUnit_Millimeter = 4,
    TarvexLengthUnit_Foot = 5,
    TarvexLengthUnit_Micrometer = 6,
    TarvexLengthUnit_Kilometer = 7,
    TarvexLengthUnit_Yard = 8,
    TarvexLengthUnit_Mile = 9,
};

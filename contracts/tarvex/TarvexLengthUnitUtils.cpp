#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>

#include <array>
#include <optional>

namespace {

struct UnitRow {
    TarvexLengthUnitType unit;
    char16_t const* text;
    double metres;
};

constexpr std::array<UnitRow, 9> kUnits{{
    {TarvexLengthUnit_Meter, u"m", 1.0},
    {TarvexLengthUnit_Centimeter, u"cm", 0.01},
    {TarvexLengthUnit_Inch, u"in", 0.0254},
    {TarvexLengthUnit_Millimeter, u"mm", 0.001},
    {TarvexLengthUnit_Foot, u"ft", 0.3048},
    {TarvexLengthUnit_Micrometer, u"um", 0.000001},
    {TarvexLengthUnit_Kilometer, u"km", 1000.0},
    {TarvexLengthUnit_Yard, u"yd", 0.9144},
    {TarvexLengthUnit_Mile, u"mi", 1609.344},
}};

/// Null for Unknown and for values outside the table.
UnitRow const* findUnit(TarvexLengthUnitType unit) {
    for (UnitRow const& row : kUnits) {
        if (row.unit == unit) {
            return &row;
        }
    }
    return nullptr;
}

} // namespace

TarvexWString TarvexLengthUnitUtils::LengthUnitToString(TarvexLengthUnitType unit) {
    UnitRow const* const row = findUnit(unit);
    return row == nullptr ? TarvexWString() : TarvexWString(row->text);
}

double TarvexLengthUnitUtils::GetScalingFactor(TarvexLengthUnitType from, TarvexLengthUnitType to) {
    UnitRow const* const fromRow = findUnit(from);
    UnitRow const* const toRow = findUnit(to);
    if (fromRow == nullptr || toRow == nullptr) {
        return 1.0;
    }
    return fromRow->metres / toRow->metres;
}

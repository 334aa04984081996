#include "TarvexTestText.h"

#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>

#include <gtest/gtest.h>

#include <cmath>
#include <optional>
#include <ostream>
#include <string>

namespace {

TarvexLengthUnitType Unlisted(int value) {
    return static_cast<TarvexLengthUnitType>(value);
}

struct UnitTextCase {
    TarvexLengthUnitType unit;
    std::optional<std::u16string> text;
};

void PrintTo(UnitTextCase const& c, std::ostream* os) {
    *os << "unit " << int{c.unit};
}

class TarvexLengthUnitTextTest : public ::testing::TestWithParam<UnitTextCase> {};

TEST_P(TarvexLengthUnitTextTest, GivesTheUnitText) {
    EXPECT_EQ(TextOf(TarvexLengthUnitUtils::LengthUnitToString(GetParam().unit)), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(AllUnits, TarvexLengthUnitTextTest,
                         ::testing::Values(UnitTextCase{TarvexLengthUnit_Unknown, std::nullopt},
                                           UnitTextCase{TarvexLengthUnit_Meter, u"m"},
                                           UnitTextCase{TarvexLengthUnit_Centimeter, u"cm"},
                                           UnitTextCase{TarvexLengthUnit_Inch, u"in"},
                                           UnitTextCase{TarvexLengthUnit_Millimeter, u"mm"},
                                           UnitTextCase{TarvexLengthUnit_Foot, u"ft"},
                                           UnitTextCase{TarvexLengthUnit_Micrometer, u"um"},
                                           UnitTextCase{TarvexLengthUnit_Kilometer, u"km"},
                                           UnitTextCase{TarvexLengthUnit_Yard, u"yd"},
                                           UnitTextCase{TarvexLengthUnit_Mile, u"mi"},
                                           UnitTextCase{Unlisted(10), std::nullopt},
                                           UnitTextCase{Unlisted(-1), std::nullopt}));

struct ScalingCase {
    TarvexLengthUnitType from;
    TarvexLengthUnitType to;
    double factor;
};

void PrintTo(ScalingCase const& c, std::ostream* os) {
    *os << "unit " << int{c.from} << " to unit " << int{c.to};
}

class TarvexScalingFactorTest : public ::testing::TestWithParam<ScalingCase> {};

TEST_P(TarvexScalingFactorTest, TurnsALengthInOneUnitIntoAnother) {
    double const factor = TarvexLengthUnitUtils::GetScalingFactor(GetParam().from, GetParam().to);
    EXPECT_NEAR(factor, GetParam().factor, std::abs(GetParam().factor) * 1e-12);
}

INSTANTIATE_TEST_SUITE_P(
    Pairs, TarvexScalingFactorTest,
    ::testing::Values(ScalingCase{TarvexLengthUnit_Meter, TarvexLengthUnit_Meter, 1.0},
                      ScalingCase{TarvexLengthUnit_Meter, TarvexLengthUnit_Centimeter, 100.0},
                      ScalingCase{TarvexLengthUnit_Centimeter, TarvexLengthUnit_Meter, 0.01},
                      ScalingCase{TarvexLengthUnit_Inch, TarvexLengthUnit_Millimeter, 25.4},
                      ScalingCase{TarvexLengthUnit_Foot, TarvexLengthUnit_Inch, 12.0},
                      ScalingCase{TarvexLengthUnit_Yard, TarvexLengthUnit_Foot, 3.0},
                      ScalingCase{TarvexLengthUnit_Mile, TarvexLengthUnit_Yard, 1760.0},
                      ScalingCase{TarvexLengthUnit_Kilometer, TarvexLengthUnit_Millimeter, 1e6},
                      ScalingCase{TarvexLengthUnit_Micrometer, TarvexLengthUnit_Millimeter, 1e-3},
                      ScalingCase{TarvexLengthUnit_Millimeter, TarvexLengthUnit_Micrometer, 1e3},
                      ScalingCase{TarvexLengthUnit_Unknown, TarvexLengthUnit_Millimeter, 1.0},
                      ScalingCase{TarvexLengthUnit_Mile, TarvexLengthUnit_Unknown, 1.0},
                      ScalingCase{TarvexLengthUnit_Unknown, TarvexLengthUnit_Unknown, 1.0},
                      ScalingCase{Unlisted(42), TarvexLengthUnit_Meter, 1.0},
                      ScalingCase{TarvexLengthUnit_Inch, Unlisted(-7), 1.0}));

TEST(TarvexLengthUnitUtilsTest, FactorsBackAndForthCancel) {
    for (int from = TarvexLengthUnit_Meter; from <= TarvexLengthUnit_Mile; ++from) {
        for (int to = TarvexLengthUnit_Meter; to <= TarvexLengthUnit_Mile; ++to) {
            double const there =
                TarvexLengthUnitUtils::GetScalingFactor(Unlisted(from), Unlisted(to));
            double const back =
                TarvexLengthUnitUtils::GetScalingFactor(Unlisted(to), Unlisted(from));
            EXPECT_NEAR(there * back, 1.0, 1e-12) << from << " -> " << to;
        }
    }
}

} // namespace

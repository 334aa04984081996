#include <VizBridge/referencemodeler/ReferenceModelerServices.h>

#include <gtest/gtest.h>

#include <cmath>
#include <sstream>
#include <string>

namespace VizReferenceModeler {
namespace {

VizBox Box(double x0, double y0, double z0, double x1, double y1, double z1) {
    double const low[3] = {x0, y0, z0};
    double const high[3] = {x1, y1, z1};
    return VizBox(low, high);
}

std::string Describe(VizBox const& box) {
    if (box.IsEmpty())
        return "empty";
    std::ostringstream out;
    out << '(' << box.GetLow()[0] << ", " << box.GetLow()[1] << ", " << box.GetLow()[2] << ") to ("
        << box.GetHigh()[0] << ", " << box.GetHigh()[1] << ", " << box.GetHigh()[2] << ')';
    return out.str();
}

/// Equal up to rounding: a turn by an angle off the axes is not exact in doubles.
bool Near(VizBox const& actual, VizBox const& expected) {
    if (actual.IsEmpty() || expected.IsEmpty())
        return actual.IsEmpty() == expected.IsEmpty();
    for (int axis = 0; axis < 3; ++axis) {
        if (std::fabs(actual.GetLow()[axis] - expected.GetLow()[axis]) > 1e-12 ||
            std::fabs(actual.GetHigh()[axis] - expected.GetHigh()[axis]) > 1e-12)
            return false;
    }
    return true;
}

VizTransf Placement(double const (&rotation)[3][3], double x, double y, double z) {
    double const translation[3] = {x, y, z};
    return VizTransf(rotation, translation);
}

constexpr double Identity[3][3] = {{1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
/// 90 degrees about z: x goes to y, y to -x.
constexpr double QuarterTurnZ[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
/// 45 degrees about z: the corners of a square land on the axes, so the box around the
/// moved box needs all of them.
double const Half = std::sqrt(0.5);
double const EighthTurnZ[3][3] = {{Half, -Half, 0}, {Half, Half, 0}, {0, 0, 1}};
double const Root2 = std::sqrt(2.0);

struct ExplodeCase {
    char const* name;
    VizTransf transformation;
    VizBox box;
    double factors[3];
    VizBox expected;
};

TEST(ReferenceModelerExplodeBox, MovesTheBoxThenPushesItAwayFromTheOrigin) {
    ExplodeCase const cases[] = {
        {"identity, no explode",
         VizTransf(),
         Box(1, 2, 3, 4, 5, 6),
         {0, 0, 0},
         Box(1, 2, 3, 4, 5, 6)},
        {"translation",
         Placement(Identity, 10, -20, 30),
         Box(0, 0, 0, 1, 2, 3),
         {0, 0, 0},
         Box(10, -20, 30, 11, -18, 33)},
        {"quarter turn about z",
         Placement(QuarterTurnZ, 0, 0, 0),
         Box(1, 0, 0, 2, 1, 1),
         {0, 0, 0},
         Box(-1, 1, 0, 0, 2, 1)},
        {"eighth turn about z",
         Placement(EighthTurnZ, 0, 0, 0),
         Box(-1, -1, 0, 1, 1, 1),
         {0, 0, 0},
         Box(-Root2, -Root2, 0, Root2, Root2, 1)},
        {"uniform scale",
         VizTransf(2.0),
         Box(-1, -1, -1, 1, 1, 1),
         {0, 0, 0},
         Box(-2, -2, -2, 2, 2, 2)},
        {"factor 1 doubles the distance",
         VizTransf(),
         Box(9, -1, -1, 11, 1, 1),
         {1, 0, 0},
         Box(19, -1, -1, 21, 1, 1)},
        {"factor 2 triples it",
         VizTransf(),
         Box(9, -1, -1, 11, 1, 1),
         {2, 0, 0},
         Box(29, -1, -1, 31, 1, 1)},
        {"each axis its own factor",
         VizTransf(),
         Box(-1, 3, -3, 1, 5, -1),
         {5, 0.5, 1},
         Box(-1, 5, -5, 1, 7, -3)},
        {"explodes the moved box",
         Placement(QuarterTurnZ, 0, 0, 0),
         Box(9, -1, -1, 11, 1, 1),
         {1, 1, 1},
         Box(-1, 19, -1, 1, 21, 1)},
        {"a box at the origin stays",
         VizTransf(),
         Box(-1, -2, -3, 1, 2, 3),
         {4, 4, 4},
         Box(-1, -2, -3, 1, 2, 3)},
        {"empty", Placement(QuarterTurnZ, 5, 5, 5), VizBox(), {1, 2, 3}, VizBox()},
    };
    ReferenceModelerServices services;
    for (ExplodeCase const& c : cases) {
        VizBox const exploded =
            services.ExplodeBox(c.transformation, c.box, c.factors[0], c.factors[1], c.factors[2]);
        EXPECT_TRUE(Near(exploded, c.expected))
            << c.name << ": " << Describe(exploded) << ", expected " << Describe(c.expected);
    }
}

} // namespace
} // namespace VizReferenceModeler

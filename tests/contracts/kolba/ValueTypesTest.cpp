#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/contracts/kolba/VizTransf.h>

#include <gtest/gtest.h>

#include <array>
#include <cfloat>
#include <tuple>
#include <utility>
#include <vector>

using namespace KolbaVizCore;

namespace {

using Triple = std::array<double, 3>;

VizBox box(Triple const& low, Triple const& high) {
    return VizBox(low.data(), high.data());
}

} // namespace

TEST(VizBox, ScalesAboutTheOriginAndAddsNoEmptyBox) {
    std::pair<double, VizBox> const scalings[] = {
        {2.0, box({0, 0, 4}, {4, 8, 8})},
        {0.5, box({0, 0, 1}, {1, 2, 2})},
        {0.0, box({0, 0, 0}, {0, 0, 0})},
        {-2.0, box({-4, -8, -8}, {0, 0, -4})}, // mirrored
    };
    for (auto const& [factor, scaled] : scalings) {
        VizBox scaling = box({0, 0, 2}, {2, 4, 4});
        scaling.Scale(factor);
        EXPECT_EQ(scaling, scaled) << factor;
    }
    VizBox sum = box({-100, -100, 9}, {100, 100, 8}); // empty on z only
    sum.Scale(3.0);                                   // and stays so
    sum.Add(VizBox());
    sum.Add(box({0, 0, 0}, {1, 1, 1}));
    EXPECT_EQ(sum, box({0, 0, 0}, {1, 1, 1})) << "an empty box lends no axis to a sum";

    Triple center{-1, -1, -1};
    VizBox().GetCenter(center.data());
    EXPECT_EQ(center, (Triple{0, 0, 0}));
    box({DBL_MAX, 0, -DBL_MAX}, {DBL_MAX, 3, DBL_MAX}).GetCenter(center.data());
    EXPECT_EQ(center, (Triple{DBL_MAX, 1.5, 0})) << "no overflow";
}

TEST(VizTransf, AppliesRowsThenTheShiftAndComposesRightOperandFirst) {
    double const aboutZ[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    double const aboutX[3][3] = {{1, 0, 0}, {0, 0, -1}, {0, 1, 0}};
    double const shift[3] = {10, 20, 30};
    VizTransf const turn(aboutZ, shift);
    VizTransf const scale(2.0);
    std::tuple<VizTransf, Triple, Triple> const cases[] = {
        {turn, {1, 0, 0}, {10, 21, 30}},
        {turn * VizTransf(aboutX, nullptr), {1, 2, 3}, {13, 21, 32}}, // turned about x first
        {scale * turn, {1, 2, 3}, {16, 42, 66}},
        {VizTransf(nullptr, nullptr), {1, 2, 3}, {1, 2, 3}},
    };
    for (auto const& [transf, point, expected] : cases) {
        Triple image = point;
        transf.Apply(image.data(), image.data()); // in place
        EXPECT_EQ(image, expected);
    }
    std::array<double, 16> array{};
    (turn * scale).AsArray(array.data());
    EXPECT_EQ(array, (std::array<double, 16>{0, 2, 0, 0, -2, 0, 0, 0, 0, 0, 2, 0, 10, 20, 30, 1}));
}

TEST(EntityId, OrdersByIdThenParentThenType) {
    // Ascending: an earlier word outweighs every later one.
    std::vector<EntityId> const ascending = {
        EntityId(9, 10005, 1), EntityId(0, 10000, 2), EntityId(0, 10001, 2),
        EntityId(1, 10000, 2), EntityId(1, 10002, 2), EntityId(0, 10000, 3),
    };
    for (std::size_t i = 1; i < ascending.size(); ++i)
        EXPECT_TRUE(ascending[i - 1] < ascending[i] && !(ascending[i] < ascending[i - 1])) << i;
    EXPECT_EQ(EntityId(1, Face, 2), EntityId(1, Face, 2));
    EXPECT_NE(EntityId(1, Face, 2), EntityId(1, Edge, 2));
}

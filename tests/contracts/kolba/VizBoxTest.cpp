#include <VizBridge/contracts/kolba/VizBox.h>

#include <gtest/gtest.h>

#include <array>
#include <cfloat>

using KolbaVizCore::VizBox;

namespace {

using Triple = std::array<double, 3>;

Triple low(VizBox const& box) {
    return {box.GetLow()[0], box.GetLow()[1], box.GetLow()[2]};
}
Triple high(VizBox const& box) {
    return {box.GetHigh()[0], box.GetHigh()[1], box.GetHigh()[2]};
}
Triple center(VizBox const& box) {
    Triple c{-1.0, -1.0, -1.0};
    box.GetCenter(c.data());
    return c;
}
VizBox makeBox(Triple const& lo, Triple const& hi) {
    return VizBox(lo.data(), hi.data());
}

} // namespace

TEST(VizBox, DefaultIsEmptyWithACentreAtTheOrigin) {
    VizBox const box;
    EXPECT_TRUE(box.IsEmpty());
    EXPECT_EQ(center(box), (Triple{0.0, 0.0, 0.0}));
    EXPECT_GT(low(box)[0], high(box)[0]);
}

TEST(VizBox, IsEmptyWhenAnyAxisIsInverted) {
    struct Case {
        char const* name;
        Triple lo;
        Triple hi;
        bool empty;
    } const cases[] = {
        {"proper", {0, 0, 0}, {1, 2, 3}, false},
        {"a single point", {1, 1, 1}, {1, 1, 1}, false},
        {"flat in z", {0, 0, 5}, {1, 1, 5}, false},
        {"inverted in x only", {2, 0, 0}, {1, 1, 1}, true},
        {"inverted in z only", {0, 0, 2}, {1, 1, 1}, true},
        {"inverted everywhere", {1, 1, 1}, {0, 0, 0}, true},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(makeBox(c.lo, c.hi).IsEmpty(), c.empty);
    }
}

TEST(VizBox, AddingPointsGrowsTheBox) {
    VizBox box;
    double const first[3] = {1.0, -2.0, 3.0};
    box.Add(first);
    EXPECT_FALSE(box.IsEmpty());
    EXPECT_EQ(low(box), (Triple{1.0, -2.0, 3.0}));
    EXPECT_EQ(high(box), (Triple{1.0, -2.0, 3.0}));

    double const second[3] = {-1.0, 4.0, 3.5};
    double const inside[3] = {0.0, 0.0, 3.2};
    box.Add(second);
    box.Add(inside);
    EXPECT_EQ(low(box), (Triple{-1.0, -2.0, 3.0}));
    EXPECT_EQ(high(box), (Triple{1.0, 4.0, 3.5}));
    EXPECT_EQ(center(box), (Triple{0.0, 1.0, 3.25}));
}

TEST(VizBox, AddingBoxesTakesTheUnionAndIgnoresEmptyOnes) {
    VizBox box = makeBox({0, 0, 0}, {1, 1, 1});
    box.Add(VizBox());
    box.Add(makeBox({5, 0, 0}, {4, 1, 1})); // empty on x only
    EXPECT_EQ(box, makeBox({0, 0, 0}, {1, 1, 1}));

    box.Add(makeBox({-1, 0.5, 0.5}, {0.5, 3, 0.75}));
    EXPECT_EQ(low(box), (Triple{-1, 0, 0}));
    EXPECT_EQ(high(box), (Triple{1, 3, 1}));

    VizBox fromEmpty;
    fromEmpty.Add(box);
    EXPECT_EQ(fromEmpty, box);

    // Empty on one axis only: its finite axes must not leak into the union.
    VizBox partlyEmpty = makeBox({-100, -100, 9}, {100, 100, 8});
    partlyEmpty.Add(makeBox({0, 0, 0}, {1, 1, 1}));
    EXPECT_EQ(low(partlyEmpty), (Triple{0, 0, 0}));
    EXPECT_EQ(high(partlyEmpty), (Triple{1, 1, 1}));
}

TEST(VizBox, ScalesAboutTheOrigin) {
    struct Case {
        char const* name;
        double factor;
        Triple lo;
        Triple hi;
    } const cases[] = {
        {"double", 2.0, {0, 0, 4}, {4, 8, 8}},
        {"half", 0.5, {0, 0, 1}, {1, 2, 2}},
        {"unchanged", 1.0, {0, 0, 2}, {2, 4, 4}},
        {"to the origin", 0.0, {0, 0, 0}, {0, 0, 0}},
        {"mirrored through the origin", -2.0, {-4, -8, -8}, {0, 0, -4}},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        VizBox box = makeBox({0, 0, 2}, {2, 4, 4});
        box.Scale(c.factor);
        for (int axis = 0; axis < 3; ++axis) {
            EXPECT_DOUBLE_EQ(low(box)[axis], c.lo[axis]);
            EXPECT_DOUBLE_EQ(high(box)[axis], c.hi[axis]);
        }
    }

    VizBox empty;
    empty.Scale(3.0);
    EXPECT_TRUE(empty.IsEmpty());
}

TEST(VizBox, CentreOfAHugeBoxDoesNotOverflow) {
    VizBox const box = makeBox({DBL_MAX, DBL_MAX, -DBL_MAX}, {DBL_MAX, DBL_MAX, DBL_MAX});
    EXPECT_EQ(center(box), (Triple{DBL_MAX, DBL_MAX, 0.0}));
}

TEST(VizBox, AllEmptyBoxesAreEqual) {
    EXPECT_EQ(VizBox(), makeBox({1, 1, 1}, {0, 0, 0}));
    EXPECT_FALSE(VizBox() == makeBox({0, 0, 0}, {0, 0, 0}));
    EXPECT_FALSE(makeBox({0, 0, 0}, {1, 1, 1}) == makeBox({0, 0, 0}, {1, 1, 2}));
}

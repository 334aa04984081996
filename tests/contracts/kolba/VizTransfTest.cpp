#include <VizBridge/contracts/kolba/VizTransf.h>

#include <gtest/gtest.h>

#include <array>

using KolbaVizCore::VizTransf;

namespace {

using Array16 = std::array<double, 16>;
using Point = std::array<double, 3>;

Array16 asArray(VizTransf const& transf) {
    Array16 out;
    out.fill(-99.0);
    transf.AsArray(out.data());
    return out;
}

Point mapPoint(VizTransf const& transf, Point const& p) {
    Point out{};
    transf.Apply(p.data(), out.data());
    return out;
}

// A quarter turn about z followed by a shift.
VizTransf quarterTurnAndShift() {
    double const rotation[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    double const translation[3] = {10, 20, 30};
    return VizTransf(rotation, translation);
}

} // namespace

TEST(VizTransf, AsArrayIsColumnMajorWithTheTranslationLast) {
    double const rotation[3][3] = {{1, 2, 3}, {4, 5, 6}, {7, 8, 9}};
    double const translation[3] = {10, 11, 12};
    EXPECT_EQ(asArray(VizTransf(rotation, translation)),
              (Array16{1, 4, 7, 0, 2, 5, 8, 0, 3, 6, 9, 0, 10, 11, 12, 1}));
    EXPECT_EQ(asArray(VizTransf()), (Array16{1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1}));
    EXPECT_EQ(asArray(VizTransf(2.5)),
              (Array16{2.5, 0, 0, 0, 0, 2.5, 0, 0, 0, 0, 2.5, 0, 0, 0, 0, 1}));
}

TEST(VizTransf, KnowsTheIdentity) {
    double const identityRows[3][3] = {{1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
    double const noShift[3] = {0, 0, 0};
    double const shift[3] = {0, 0, 1e-12};
    EXPECT_TRUE(VizTransf().IsIdentity());
    EXPECT_TRUE(VizTransf(1.0).IsIdentity());
    EXPECT_TRUE(VizTransf(identityRows, noShift).IsIdentity());
    EXPECT_TRUE(VizTransf(nullptr, nullptr).IsIdentity());
    EXPECT_FALSE(VizTransf(2.0).IsIdentity());
    EXPECT_FALSE(VizTransf(identityRows, shift).IsIdentity());
    EXPECT_FALSE(quarterTurnAndShift().IsIdentity());
}

TEST(VizTransf, AppliesTheMatrixByRowsThenTheTranslation) {
    VizTransf const transf = quarterTurnAndShift();
    EXPECT_EQ(mapPoint(transf, {1, 0, 0}), (Point{10, 21, 30}));
    EXPECT_EQ(mapPoint(transf, {0, 1, 0}), (Point{9, 20, 30}));
    EXPECT_EQ(mapPoint(VizTransf(3.0), {1, -2, 0.5}), (Point{3, -6, 1.5}));

    Point inPlace{1, 2, 3};
    transf.Apply(inPlace.data(), inPlace.data());
    EXPECT_EQ(inPlace, (Point{8, 21, 33}));
}

TEST(VizTransf, CompositionAppliesTheRightOperandFirst) {
    VizTransf const turn = quarterTurnAndShift();
    VizTransf const scale(2.0);
    Point const p{1, 2, 3};

    EXPECT_EQ(mapPoint(turn * scale, p), mapPoint(turn, mapPoint(scale, p)));
    EXPECT_EQ(mapPoint(scale * turn, p), mapPoint(scale, mapPoint(turn, p)));
    EXPECT_EQ(mapPoint(turn * scale, p), (Point{6, 22, 36}));
    EXPECT_EQ(mapPoint(scale * turn, p), (Point{16, 42, 66}));
    EXPECT_FALSE(turn * scale == scale * turn);

    EXPECT_EQ(turn * VizTransf(), turn);
    EXPECT_EQ(VizTransf() * turn, turn);
    // Four quarter turns without shifts are the identity again.
    double const rotation[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    VizTransf const quarter(rotation, nullptr);
    EXPECT_TRUE((quarter * quarter * quarter * quarter).IsIdentity());
    EXPECT_EQ(asArray(turn * scale), (Array16{0, 2, 0, 0, -2, 0, 0, 0, 0, 0, 2, 0, 10, 20, 30, 1}));
}

TEST(VizTransf, EqualityIsExact) {
    double const rotation[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    double const translation[3] = {10, 20, 30 + 1e-9};
    EXPECT_EQ(quarterTurnAndShift(), quarterTurnAndShift());
    EXPECT_FALSE(quarterTurnAndShift() == VizTransf(rotation, translation));
    EXPECT_FALSE(VizTransf(2.0) == VizTransf(2.0 + 1e-15));
}

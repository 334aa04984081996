#include <VizBridge/render/ReferenceRenderer.h>

#include <gtest/gtest.h>

#include <vector>

namespace VizBridgeTarvex {
namespace {

TEST(ReferenceRenderer, KeepsItsMatrixWithEveryElementBelowTheLimitAsZero) {
    double full[16] = {1, 5e-11, -2, 3, 0, 1e-10, 0, 0, 0, 0, 1, 0, 7, 8, 9, 1};
    ReferenceRenderer const fromMatrix(nullptr, full);
    EXPECT_EQ(std::vector<double>(fromMatrix.matrix, fromMatrix.matrix + 16),
              (std::vector<double>{1, 0, 0, 3, 0, 1e-10, 0, 0, 0, 0, 1, 0, 7, 8, 9, 1}))
        << "the test is on the signed value: negative elements become 0 too";

    double rotation[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    double translation[4] = {10, 99, 20, 30}; // element 1 is not read
    ReferenceRenderer const fromParts(nullptr, rotation, translation);
    EXPECT_EQ(std::vector<double>(fromParts.matrix, fromParts.matrix + 16),
              (std::vector<double>{0, 0, 0, 10, 1, 0, 0, 20, 0, 0, 1, 30, 0, 0, 0, 1}));
    EXPECT_EQ(fromParts.renderer, nullptr);
}

} // namespace
} // namespace VizBridgeTarvex

#include <VizBridge/contracts/platform/Sleep.h>

#include <gtest/gtest.h>

#include <chrono>

TEST(Sleep, WaitsAtLeastTheGivenTime) {
    auto const start = std::chrono::steady_clock::now();
    VizPort::Sleep(20);
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(20));
}

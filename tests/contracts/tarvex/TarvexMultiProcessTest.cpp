#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <thread>

namespace {

int MachineProcessors() {
    return std::max(static_cast<int>(std::thread::hardware_concurrency()), 1);
}

TEST(TarvexMultiProcessTest, UsesEveryProcessorOfTheMachineByDefault) {
    // Every test that changes the settings puts them back with a scoped guard.
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 0);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), MachineProcessors());
}

TEST(TarvexMultiProcessTest, AScopedGuardSetsBothAndRestoresThemInReverse) {
    {
        TarvexScopedProcessors const outer(4, 8);
        EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 4);
        EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), 8);
        {
            TarvexScopedProcessors const inner(1, std::nullopt);
            EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 1);
            EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), MachineProcessors());
            // Set inside the inner scope: undone with it too.
            TarvexMultiProcess::SetNumberOfProcessorsToUse(6);
            TarvexMultiProcess::SetPhysicalProcessorsOverride(2);
        }
        EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 4);
        EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), 8);
    }
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 0);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), MachineProcessors());
}

TEST(TarvexMultiProcessTest, CountsOutsideTheirRangeAreTakenAsTheNearestMeaningfulOne) {
    TarvexScopedProcessors const guard(0, std::nullopt);
    TarvexMultiProcess::SetNumberOfProcessorsToUse(-3);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfProcessorsToUse(), 0);
    TarvexMultiProcess::SetPhysicalProcessorsOverride(0);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), 1);
    TarvexMultiProcess::SetPhysicalProcessorsOverride(-5);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), 1);
    TarvexMultiProcess::SetPhysicalProcessorsOverride(std::nullopt);
    EXPECT_EQ(TarvexMultiProcess::GetNumberOfPhysicalProcessors(), MachineProcessors());
}

} // namespace

#include <VizBridge/contracts/kolba/Stopwatch.h>

#include <gtest/gtest.h>

#include <thread>

using KolbaVizCore::Stopwatch;

// Only lower bounds are asserted: a loaded machine may always take longer.
namespace {
void pause(int milliseconds) {
    std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}
} // namespace

TEST(Stopwatch, StartsStoppedAtZero) {
    Stopwatch const watch;
    EXPECT_FALSE(watch.IsRunning());
    EXPECT_EQ(watch.GetElapsedTime(), 0.0);
}

TEST(Stopwatch, RunningTimeGrowsAndStoppedTimeStands) {
    Stopwatch watch;
    watch.Start();
    EXPECT_TRUE(watch.IsRunning());
    double const early = watch.GetElapsedTime();
    EXPECT_GE(early, 0.0);
    pause(20);
    double const later = watch.GetElapsedTime();
    EXPECT_GE(later, early + 0.020);

    watch.Stop();
    EXPECT_FALSE(watch.IsRunning());
    double const stopped = watch.GetElapsedTime();
    EXPECT_GE(stopped, later);
    pause(5);
    EXPECT_EQ(watch.GetElapsedTime(), stopped);
}

TEST(Stopwatch, SumsEveryStartStopPair) {
    Stopwatch watch;
    watch.Start();
    pause(15);
    watch.Stop();
    double const first = watch.GetElapsedTime();
    EXPECT_GE(first, 0.015);

    watch.Start();
    pause(15);
    watch.Stop();
    EXPECT_GE(watch.GetElapsedTime(), first + 0.015);
}

TEST(Stopwatch, IgnoresAStartWhileRunningAndAStopWhileStopped) {
    Stopwatch watch;
    watch.Stop();
    EXPECT_FALSE(watch.IsRunning());
    EXPECT_EQ(watch.GetElapsedTime(), 0.0);

    watch.Start();
    pause(20);
    watch.Start(); // would lose the 20 ms if it restarted the pair
    watch.Stop();
    double const elapsed = watch.GetElapsedTime();
    EXPECT_GE(elapsed, 0.020);

    pause(5);
    watch.Stop();
    EXPECT_EQ(watch.GetElapsedTime(), elapsed);
}

TEST(Stopwatch, ResetStopsAndClears) {
    Stopwatch watch;
    watch.Start();
    pause(2);
    watch.Reset();
    EXPECT_FALSE(watch.IsRunning());
    EXPECT_EQ(watch.GetElapsedTime(), 0.0);
}

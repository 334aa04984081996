#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/kolba/Dbg.h>
#include <VizBridge/contracts/kolba/Stopwatch.h>

#include <gtest/gtest.h>

#include <chrono>
#include <sstream>
#include <thread>

using namespace KolbaVizCore;

TEST(AllowThrow, IsOffByDefaultAndScopesRestoreIt) {
    EXPECT_FALSE(GetAllowThrow());
    {
        ScopedAllowThrow const on(true);
        { ScopedAllowThrow const off(false); }
        EXPECT_TRUE(GetAllowThrow());
    }
    EXPECT_FALSE(GetAllowThrow());
}

TEST(Dbg, DiscardsUntilAHostGivesItABufferAndResetSilencesItAgain) {
    testing::internal::CaptureStdout();
    testing::internal::CaptureStderr();
    dbg << "TarvexRenderer::Render : nothing to see" << std::endl;
    std::string const err = testing::internal::GetCapturedStderr();
    EXPECT_EQ(testing::internal::GetCapturedStdout() + err, "");
    EXPECT_TRUE(dbg.good()) << "a discarded write is still a successful one";

    std::ostringstream captured;
    dbg.rdbuf(captured.rdbuf());
    dbg << "TarvexRenderer::Render : failed" << std::endl;
    dbg.rdbuf(nullptr); // leaves the stream bad
    dbg << "nowhere";
    ResetDbg();
    dbg << "dropped" << std::endl;
    EXPECT_TRUE(dbg.good()) << "a reset repairs the stream";
    EXPECT_EQ(captured.str(), "TarvexRenderer::Render : failed\n");
}

// Only lower bounds are asserted: a loaded machine may always take longer.
TEST(Stopwatch, SumsItsStartStopPairsAndIgnoresRepeatedStartsAndStops) {
    auto const pause = [] { std::this_thread::sleep_for(std::chrono::milliseconds(15)); };
    Stopwatch watch;
    watch.Start();
    pause();
    watch.Start(); // would lose the first 15 ms if it restarted the pair
    watch.Stop();
    double const first = watch.GetElapsedTime();
    EXPECT_GE(first, 0.015);
    pause();
    watch.Stop();
    EXPECT_EQ(watch.GetElapsedTime(), first) << "stopped time stands";
    watch.Start();
    pause();
    EXPECT_GE(watch.GetElapsedTime(), first + 0.015) << "the running pair counts";
    watch.Reset();
    EXPECT_EQ(watch.GetElapsedTime(), 0.0);
}

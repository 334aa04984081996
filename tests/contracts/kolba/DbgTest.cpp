#include <VizBridge/contracts/kolba/Dbg.h>

#include <gtest/gtest.h>

#include <iostream>
#include <sstream>

using KolbaVizCore::dbg;
using KolbaVizCore::ResetDbg;

namespace {

/// Leaves the stream silent again whatever a test did to it.
class DbgReset {
public:
    DbgReset() = default;
    ~DbgReset() { ResetDbg(); }
    DbgReset(DbgReset const&) = delete;
    DbgReset& operator=(DbgReset const&) = delete;
};

} // namespace

TEST(Dbg, IsSilentByDefault) {
    EXPECT_NE(dbg.rdbuf(), std::cout.rdbuf());
    EXPECT_NE(dbg.rdbuf(), std::cerr.rdbuf());
    EXPECT_NE(dbg.rdbuf(), std::clog.rdbuf());
    testing::internal::CaptureStdout();
    testing::internal::CaptureStderr();
    dbg << "TarvexRenderer::Render : nothing to see" << 42 << std::endl;
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
    EXPECT_TRUE(dbg.good()) << "a discarded write is still a successful one";
}

TEST(Dbg, AHostBufferCapturesUntilReset) {
    DbgReset const reset;
    std::ostringstream captured;
    dbg.rdbuf(captured.rdbuf());
    dbg << "TarvexRenderer::Render : failed" << std::endl;
    EXPECT_EQ(captured.str(), "TarvexRenderer::Render : failed\n");

    ResetDbg();
    dbg << "dropped" << std::endl;
    EXPECT_EQ(captured.str(), "TarvexRenderer::Render : failed\n");
}

TEST(Dbg, ResetRepairsAStreamLeftWithoutABuffer) {
    DbgReset const reset;
    dbg.rdbuf(nullptr);
    dbg << "nowhere";
    EXPECT_TRUE(dbg.bad());
    ResetDbg();
    EXPECT_TRUE(dbg.good());
    dbg << "fine";
    EXPECT_TRUE(dbg.good());
}

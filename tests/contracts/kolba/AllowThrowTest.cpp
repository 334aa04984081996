#include <VizBridge/contracts/kolba/AllowThrow.h>

#include <gtest/gtest.h>

using KolbaVizCore::GetAllowThrow;
using KolbaVizCore::ScopedAllowThrow;

TEST(AllowThrow, IsOffByDefaultAndScopesRestoreIt) {
    EXPECT_FALSE(GetAllowThrow());
    {
        ScopedAllowThrow const on(true);
        EXPECT_TRUE(GetAllowThrow());
        {
            ScopedAllowThrow const off(false);
            EXPECT_FALSE(GetAllowThrow());
        }
        EXPECT_TRUE(GetAllowThrow());
    }
    EXPECT_FALSE(GetAllowThrow());
}

#include <VizBridge/contracts/kolba/RenderId.h>

#include <gtest/gtest.h>

#include <vector>

using KolbaVizCore::RenderId;

TEST(RenderId, HoldsALeadingWordAndAPathOfTags) {
    RenderId id(1);
    EXPECT_TRUE(id.IsEmpty());
    EXPECT_EQ(id.GetLeading(), 1u);

    id.AddValue(3);
    id.AddValue(10003);
    id.AddValue(0xFFFFFFFFu);
    EXPECT_EQ(id.Length(), 3);
    EXPECT_EQ(id[0], 3u);
    EXPECT_EQ(id[2], 0xFFFFFFFFu);
    id[1] = 10005;
    EXPECT_EQ(id.GetTags(), (std::vector<std::uint32_t>{3, 10005, 0xFFFFFFFFu}));
}

TEST(RenderId, SetLengthCutsOrPadsWithZero) {
    RenderId id;
    id.AddValue(4);
    id.AddValue(5);
    id.SetLength(4);
    EXPECT_EQ(id.GetTags(), (std::vector<std::uint32_t>{4, 5, 0, 0}));
    id.SetLength(1);
    EXPECT_EQ(id.GetTags(), std::vector<std::uint32_t>{4});
    id.SetLength(-3);
    EXPECT_TRUE(id.IsEmpty());
}

TEST(RenderId, ClearKeepsTheLeadingWord) {
    RenderId id(7);
    id.AddValue(1);
    id.Clear();
    EXPECT_TRUE(id.IsEmpty());
    EXPECT_EQ(id.Length(), 0);
    EXPECT_EQ(id.GetLeading(), 7u);
    id.SetLeading(1);
    EXPECT_EQ(id.GetLeading(), 1u);
}

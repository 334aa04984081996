#include <VizBridge/contracts/platform/WString.h>

#include <gtest/gtest.h>

#include <string>

using VizPort::Narrow;
using VizPort::Widen;
using VizPort::WString;

TEST(WString, WidenMapsEachByteToOneCharacter) {
    EXPECT_EQ(Widen(""), u"");
    EXPECT_EQ(Widen("Part 1"), u"Part 1");
    // Bytes above 0x7F are taken as they are, not as UTF-8 and not sign-extended.
    EXPECT_EQ(Widen("\xC3\xA9"), (WString{char16_t{0xC3}, char16_t{0xA9}}));
    EXPECT_EQ(Widen(std::string("a\0b", 3)), (WString{u'a', u'\0', u'b'}));
}

TEST(WString, NarrowKeepsTheLowByteRangeAndMarksTheRest) {
    EXPECT_EQ(Narrow(u""), "");
    EXPECT_EQ(Narrow(u"VizPMI"), "VizPMI");
    EXPECT_EQ(Narrow(WString{char16_t{0xFF}, char16_t{0x100}, u'\u03A9', u'x'}),
              (std::string{'\xFF', '?', '?', 'x'}));
}

TEST(WString, NarrowUndoesWidenForEveryByte) {
    std::string bytes;
    for (int b = 0; b < 256; ++b)
        bytes.push_back(static_cast<char>(b));
    EXPECT_EQ(Narrow(Widen(bytes)), bytes);
}

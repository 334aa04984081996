#include "support/DebugCapture.h"

#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/contracts/platform/RecursiveLock.h>
#include <VizBridge/contracts/platform/Sleep.h>
#include <VizBridge/contracts/platform/WString.h>

#include <gtest/gtest.h>

#include <atomic>
#include <cfloat>
#include <chrono>
#include <climits>
#include <cstdio>
#include <limits>
#include <locale>
#include <mutex>
#include <stdexcept>
#include <string>
#include <thread>
#include <utility>
#include <vector>

using namespace VizPort;

namespace {

using Texts = std::vector<WString>;

TEST(FormatW, FormatsAsSwprintfIntoAFixedBufferWouldAndNeverThrows) {
    char16_t const* const none = nullptr;
    double const inf = std::numeric_limits<double>::infinity();
    std::pair<WString, WString> const cases[] = {
        {FormatW(64, u"no conversions", {}), u"no conversions"},
        {FormatW(64, u"%d %d %d", {-7, INT_MIN, INT_MAX}), u"-7 -2147483648 2147483647"},
        {FormatW(64, u"%lu %lu %f", {0ul, ULONG_MAX, -2.25}), u"0 18446744073709551615 -2.250000"},
        {FormatW(64, u"100%%%d", {3}), u"100%3"},
        // Fixed notation as printf in the C locale has it.
        {FormatW(64, u"%f|%f|%f|%f", {-0.0, 2.0 / 3.0, 0.0000005, -1e-9}),
         u"-0.000000|0.666667|0.000000|-0.000000"},
        {FormatW(64, u"%f %f %f %f", {1e22, DBL_MIN, inf, -inf}),
         u"10000000000000000000000.000000 0.000000 inf -inf"},
        {FormatW(64, u"%f", {std::numeric_limits<double>::quiet_NaN()}), u"nan"},
        {FormatW(1024, u"%s (RefID %d) Error : %s", {u"\u03A9\u4E2D", 12, u"bad"}),
         u"\u03A9\u4E2D (RefID 12) Error : bad"},
        // A result that does not fit is cut to one character less than the buffer.
        {FormatW(0, u"a", {}) + FormatW(1, u"a", {}), u""},
        {FormatW(3, u"abc", {}) + u"|" + FormatW(4, u"abc", {}), u"ab|abc"},
        {FormatW(4, u"<%s>", {u"abcdef"}) + u"|" + FormatW(4, u"%d", {-123456}), u"<ab|-12"},
        {FormatW(17, u"%f", {DBL_MAX}), u"1797693134862315"},
        {FormatW(std::numeric_limits<std::size_t>::max(), u"%d", {5}), u"5"},
        // A bad format or argument prints nothing in its place; an unknown conversion stands.
        {FormatW(64, u"<%s>", {none}) + FormatW(64, nullptr, {1}), u"<>"},
        {FormatW(64, u"%d-%d", {1}), u"1-"},
        {FormatW(64, u"<%d%f%lu%s%d%d>", {1.5, 1, 1, 1, 1ul, u"1"}), u"<>"},
        {FormatW(64, u"%d|%d", {2.0, 7}), u"|7"},
        {FormatW(64, u"%d", {1, 2, 3}), u"1"},
        {FormatW(64, u"%x%5d%ld|%d 50%", {3}), u"%x%5d%ld|3 50%"},
    };
    for (auto const& [actual, expected] : cases) {
        EXPECT_EQ(actual, expected) << Narrow(expected);
    }
    // The longest fixed number, 317 characters, is printed in full.
    EXPECT_EQ(FormatW(512, u"%f", {-DBL_MAX}).substr(305), u"58368.000000");
}

TEST(FormatW, NumbersIgnoreTheProcessLocale) {
    std::locale previous;
    try {
        previous = std::locale::global(std::locale("de_DE.UTF-8"));
    } catch (std::runtime_error const&) {
        GTEST_SKIP() << "the locale de_DE.UTF-8 is not installed";
    }
    char comma[32];
    std::snprintf(comma, sizeof comma, "%.1f", 1.5);
    WString const formatted = FormatW(64, u"%f %d %lu", {1.5, 1234567, 1234567ul});
    std::locale::global(previous);
    ASSERT_STREQ(comma, "1,5") << "the decimal-comma locale was not in force";
    EXPECT_EQ(formatted, u"1.500000 1234567 1234567");
}

TEST(DebugOutput, IsSilentUntilASinkIsSetAndScopedSinksRestoreTheOneTheyReplaced) {
    // Every test puts back the sink it found, so the process default is in force here.
    DebugSink const initial = SetDebugSink(DebugSink{});
    EXPECT_FALSE(initial) << "debug output is silent by default";
    OutputDebugStringW(u"nobody listens");
    {
        DebugCapture const outer;
        OutputDebugStringW(u"Error on RefID 3: a\n");
        OutputDebugStringW(nullptr);
        OutputDebugStringW(u"");
        {
            DebugCapture const inner;
            OutputDebugStringW(u"b");
            EXPECT_EQ(inner.texts(), Texts{u"b"});
        }
        DebugSink const replaced = SetDebugSink(DebugSink{});
        OutputDebugStringW(u"lost");
        SetDebugSink(replaced);
        OutputDebugStringW(u"c");
        EXPECT_EQ(outer.texts(), (Texts{u"Error on RefID 3: a\n", u"", u"c"}));
    }
    EXPECT_FALSE(SetDebugSink(initial)) << "the scopes put the silent default back";
}

TEST(DebugOutput, ASinkThatThrowsLosesOnlyItsTextAndASinkMayReplaceItself) {
    Texts texts;
    int calls = 0;
    ScopedDebugSink const scope([&](char16_t const*) {
        if (++calls == 1) {
            throw std::runtime_error("sink failed");
        }
        SetDebugSink([&texts](char16_t const* text) { texts.emplace_back(text); });
        OutputDebugStringW(u"from inside");
    });
    EXPECT_NO_THROW(OutputDebugStringW(u"thrown away"));
    OutputDebugStringW(u"replaces the sink");
    OutputDebugStringW(u"after");
    EXPECT_EQ(texts, (Texts{u"from inside", u"after"}));
}

TEST(DebugOutput, ThreadsReachTheSinkOneAtATime) {
    std::atomic<int> inside{0}, overlaps{0}, calls{0};
    ScopedDebugSink const scope([&](char16_t const*) {
        overlaps += inside.fetch_add(1) != 0 ? 1 : 0;
        std::this_thread::yield();
        ++calls;
        inside.fetch_sub(1);
    });
    auto const write = [] {
        for (int i = 0; i < 2000; ++i)
            OutputDebugStringW(u"text");
    };
    std::thread first(write), second(write);
    first.join();
    second.join();
    EXPECT_EQ(overlaps, 0);
    EXPECT_EQ(calls, 4000);
}

TEST(WString, WidenTakesEachByteAsOneCharacterAndNarrowUndoesIt) {
    EXPECT_EQ(Widen(std::string("P\xC3\0", 3)), (WString{u'P', char16_t{0xC3}, u'\0'}));
    EXPECT_EQ(Narrow(WString{u'x', char16_t{0xFF}, char16_t{0x100}, u'\u03A9'}),
              (std::string{'x', '\xFF', '?', '?'}));
    EXPECT_EQ(Narrow(Widen("\x01\x7F\x80\xFF")), "\x01\x7F\x80\xFF");
}

TEST(RecursiveLock, TheHolderMayEnterAgainAndOthersWaitUntilEveryEntryIsLeft) {
    RecursiveLock lock(4000);
    auto const freeForOthers = [&lock] {
        bool taken = false;
        std::thread([&] { taken = lock.TryEnter() && (lock.Leave(), true); }).join();
        return taken;
    };
    std::unique_lock<RecursiveLock> guard(lock);
    EXPECT_TRUE(lock.TryEnter()) << "the holder may enter again";
    lock.Leave();
    EXPECT_FALSE(freeForOthers()) << "one entry is still held";
    guard.unlock();
    EXPECT_TRUE(freeForOthers());
}

TEST(Sleep, WaitsAtLeastTheGivenTime) {
    auto const start = std::chrono::steady_clock::now();
    Sleep(20);
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(20));
}

} // namespace

#include <VizBridge/contracts/platform/DebugOutput.h>

#include <gtest/gtest.h>

#include <atomic>
#include <mutex>
#include <stdexcept>
#include <thread>
#include <vector>

using VizPort::DebugSink;
using VizPort::OutputDebugStringW;
using VizPort::ScopedDebugSink;
using VizPort::SetDebugSink;
using VizPort::WString;

namespace {

/// Collects every text that reaches it, one entry per call.
class Capture {
public:
    DebugSink Sink() {
        return [this](char16_t const* text) {
            std::lock_guard<std::mutex> const lock(m_mutex);
            m_texts.emplace_back(text);
        };
    }
    std::vector<WString> Texts() const {
        std::lock_guard<std::mutex> const lock(m_mutex);
        return m_texts;
    }

private:
    mutable std::mutex m_mutex;
    std::vector<WString> m_texts;
};

} // namespace

TEST(DebugOutput, HasNoSinkUntilOneIsSet) {
    // Every test restores the sink it found, so the process default is in force here.
    DebugSink const initial = SetDebugSink(DebugSink{});
    EXPECT_FALSE(initial) << "debug output is silent by default";
    EXPECT_NO_THROW(OutputDebugStringW(u"nobody listens"));
    EXPECT_NO_THROW(OutputDebugStringW(nullptr));
    SetDebugSink(initial);
}

TEST(DebugOutput, DeliversOneTextPerCall) {
    Capture capture;
    {
        ScopedDebugSink const scope(capture.Sink());
        OutputDebugStringW(u"Error on RefID 3: first\n");
        OutputDebugStringW(nullptr);
        OutputDebugStringW(u"");
        OutputDebugStringW(u"second");
    }
    OutputDebugStringW(u"after the scope");
    EXPECT_EQ(capture.Texts(),
              (std::vector<WString>{u"Error on RefID 3: first\n", u"", u"second"}));
}

TEST(DebugOutput, SetDebugSinkReturnsTheReplacedSinkAndScopesNest) {
    Capture outer;
    Capture inner;
    {
        ScopedDebugSink const outerScope(outer.Sink());
        OutputDebugStringW(u"a");
        {
            ScopedDebugSink const innerScope(inner.Sink());
            OutputDebugStringW(u"b");
        }
        OutputDebugStringW(u"c");

        DebugSink const replaced = SetDebugSink(DebugSink{});
        ASSERT_TRUE(replaced) << "the outer sink comes back from SetDebugSink";
        OutputDebugStringW(u"lost");
        replaced(u"direct");
        SetDebugSink(replaced);
        OutputDebugStringW(u"d");
    }
    EXPECT_EQ(outer.Texts(), (std::vector<WString>{u"a", u"c", u"direct", u"d"}));
    EXPECT_EQ(inner.Texts(), std::vector<WString>{u"b"});
}

TEST(DebugOutput, ASinkThatThrowsLosesOnlyItsText) {
    ScopedDebugSink const scope([](char16_t const*) { throw std::runtime_error("sink failed"); });
    EXPECT_NO_THROW(OutputDebugStringW(u"text"));
}

TEST(DebugOutput, ASinkMayReplaceItselfWhileRunning) {
    Capture later;
    int calls = 0;
    ScopedDebugSink const scope([&](char16_t const*) {
        ++calls;
        SetDebugSink(later.Sink());
        OutputDebugStringW(u"from inside");
    });
    OutputDebugStringW(u"first");
    OutputDebugStringW(u"second");
    EXPECT_EQ(calls, 1);
    EXPECT_EQ(later.Texts(), (std::vector<WString>{u"from inside", u"second"}));
}

TEST(DebugOutput, TextsOfTwoThreadsArriveWholeAndComplete) {
    constexpr int PerThread = 2000;
    Capture capture;
    std::atomic<bool> overlapped{false};
    std::atomic<int> inside{0};
    {
        ScopedDebugSink const scope([&, sink = capture.Sink()](char16_t const* text) {
            if (inside.fetch_add(1) != 0)
                overlapped = true;
            sink(text);
            inside.fetch_sub(1);
        });
        auto writer = [](char16_t const* text) {
            for (int i = 0; i < PerThread; ++i)
                OutputDebugStringW(text);
        };
        std::thread first(writer, u"from the first thread");
        std::thread second(writer, u"from the second thread");
        first.join();
        second.join();
    }
    std::vector<WString> const texts = capture.Texts();
    ASSERT_EQ(texts.size(), 2u * PerThread);
    int fromFirst = 0;
    for (WString const& text : texts) {
        ASSERT_TRUE(text == u"from the first thread" || text == u"from the second thread");
        fromFirst += text == u"from the first thread" ? 1 : 0;
    }
    EXPECT_EQ(fromFirst, PerThread);
    EXPECT_FALSE(overlapped) << "the sink is called by one thread at a time";
}

#include "support/DebugCapture.h"
#include <VizBridge/import/BuilderErrors.h>

#include <gtest/gtest.h>

#include <stdexcept>

namespace VizBridgeTarvex {
namespace {

TEST(BuilderErrors, ExceptionTextsTakeTheirFormFromTheWhatText) {
    struct Case {
        char const* what;
        WString expected;
    };
    Case const cases[] = {
        {"boom", u"Error on Stage (RefID 7) : boom"},
        {"", u"Error on Stage (RefID 7) : "},
        {"Unhandled Exception in reader", u"Stage (RefID 7) Error : Unhandled Exception in reader"},
        {"Unhandled Exception\nthe reason\nmore", u"Stage (RefID 7) Error : the reason"},
        {"first\nUnhandled Exception", u"Stage (RefID 7) Error : Unhandled Exception"},
        {"Unhandled Exception\n", u"Stage (RefID 7) Error : Unhandled Exception\n"},
        {"unhandled exception", u"Error on Stage (RefID 7) : unhandled exception"},
        {"caf\xE9", u"Error on Stage (RefID 7) : caf\u00E9"},
    };
    for (Case const& c : cases) {
        WString out = u"old";
        BuilderErrors::formatExceptionError(u"Stage", 7, std::runtime_error(c.what), out);
        EXPECT_EQ(out, c.expected) << c.what;
    }
}

TEST(BuilderErrors, UnknownAndDebugTexts) {
    WString out;
    BuilderErrors::formatUnknownError(u"Part Import", -3, u"Unknown Exception", out);
    EXPECT_EQ(out, u"Part Import (RefID -3) Error : Unknown Exception");

    DebugCapture debug;
    BuilderErrors::reportDebugError(12, u"it failed");
    EXPECT_EQ(debug.texts(), std::vector<WString>{u"Error on RefID 12: it failed"});
}

TEST(BuilderErrors, LongTextsAreCutToTheBuffer) {
    WString const longStage(3000, u'x');
    WString out;
    BuilderErrors::formatUnknownError(longStage, 1, u"tail", out);
    EXPECT_EQ(out, longStage.substr(0, BuilderErrors::kBufferSize - 1));

    DebugCapture debug;
    BuilderErrors::reportDebugError(1, longStage);
    ASSERT_EQ(debug.texts().size(), 1u);
    EXPECT_EQ(debug.texts()[0].size(), BuilderErrors::kBufferSize - 1);
}

} // namespace
} // namespace VizBridgeTarvex

#include <VizBridge/import/BuilderErrors.h>

#include <VizBridge/contracts/platform/DebugOutput.h>
#include <VizBridge/contracts/platform/FormatW.h>

#include <string>

namespace VizBridgeTarvex::BuilderErrors {

namespace {
/// The second line of `text` if it has one (a line feed followed by more text), else
/// the whole text.
std::string secondLineOrWhole(std::string const& text) {
    std::size_t const firstBreak = text.find('\n');
    if (firstBreak == std::string::npos || firstBreak + 1 == text.size())
        return text;
    std::size_t const secondBreak = text.find('\n', firstBreak + 1);
    return text.substr(firstBreak + 1, secondBreak == std::string::npos
                                           ? std::string::npos
                                           : secondBreak - firstBreak - 1);
}
} // namespace

void reportDebugError(int const& id, WString const& text) {
    WString const message =
        VizPort::FormatW(kBufferSize, u"Error on RefID %d: %s", {id, text.c_str()});
    VizPort::OutputDebugStringW(message.c_str());
}

void formatExceptionError(WString const& stage, int const& id, std::exception const& e,
                          WString& out) {
    char const* const what = e.what();
    std::string const text = what ? what : "";
    if (text.find("Unhandled Exception") == std::string::npos) {
        WString const wide = VizPort::Widen(text);
        out = VizPort::FormatW(kBufferSize, u"Error on %s (RefID %d) : %s",
                               {stage.c_str(), id, wide.c_str()});
        return;
    }
    WString const wide = VizPort::Widen(secondLineOrWhole(text));
    out = VizPort::FormatW(kBufferSize, u"%s (RefID %d) Error : %s",
                           {stage.c_str(), id, wide.c_str()});
}

void formatUnknownError(WString const& stage, int const& id, WString const& text, WString& out) {
    out = VizPort::FormatW(kBufferSize, u"%s (RefID %d) Error : %s",
                           {stage.c_str(), id, text.c_str()});
}

Failure describeCurrentFailure(FailureSite const& site, int const& id) {
    Failure failure;
    try {
        throw;
    } catch (std::exception const& e) {
        failure.what = e.what() ? e.what() : "";
        reportDebugError(id, VizPort::Widen(failure.what));
        formatExceptionError(site.stage, id, e, failure.text);
    } catch (...) {
        reportDebugError(id, site.unknownDebug);
        formatUnknownError(site.unknownStage, id, u"Unknown Exception", failure.text);
        failure.what = VizPort::Narrow(failure.text);
    }
    return failure;
}

} // namespace VizBridgeTarvex::BuilderErrors

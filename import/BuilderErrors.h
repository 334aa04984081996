#pragma once

#include <VizBridge/model/VizTypes.h>

#include <exception>
#include <string>

namespace VizBridgeTarvex::BuilderErrors {

/// The size, in 16-bit characters with the terminator, of the buffer that every error
/// text is formatted into; longer texts are cut.
constexpr std::size_t kBufferSize = 1024;

/// Writes "Error on RefID <id>: <text>" to the debug output. Changes no data.
void reportDebugError(int const& id, WString const& text);

/// The stored text for a std::exception caught at `stage`: "Error on <stage> (RefID <id>) :
/// <what>", or, for a what() holding "Unhandled Exception", "<stage> (RefID <id>) Error :
/// <line>" with its second line if it has one, else the whole text.
void formatExceptionError(WString const& stage, int const& id, std::exception const& e,
                          WString& out);

/// "<stage> (RefID <id>) Error : <text>", for whatever was caught that is no std::exception.
void formatUnknownError(WString const& stage, int const& id, WString const& text, WString& out);

/// A place of the import that catches failures, with the texts it records them under.
struct FailureSite {
    char16_t const* stage;        ///< of a std::exception
    char16_t const* unknownStage; ///< of anything else
    char16_t const* unknownDebug; ///< the debug text of anything else
};

/// Around each child of the instance tree.
inline constexpr FailureSite kStructureInstanceSite{
    u"Product Structure Instance", u"Product Structure Part Import",
    u"Unknown exception while importing Product Structure"};
/// Around the modeler's import of one part.
inline constexpr FailureSite kPartImportSite{
    u"Part Import", u"Part Import", u"Unknown exception while importing product structure"};
/// Around the visualisation import of one part.
inline constexpr FailureSite kVisuDataImportSite{
    u"VisuData Import", u"VisuData Import", u"Unknown exception while importing product structure"};

/// What a failure left to record: the stored text, and the text of the exception that a
/// site throws on when it must.
struct Failure {
    WString text;
    std::string what; ///< what() of a std::exception; else the stored text, narrowed
};

/// The one way the import records a failure. Called from inside a catch block, it looks at
/// the exception being handled: writes its plain text to the debug output ("Error on RefID
/// <id>: ...") and gives the text to store, formatted for `site`.
Failure describeCurrentFailure(FailureSite const& site, int const& id);

} // namespace VizBridgeTarvex::BuilderErrors

#pragma once

#include <TDocStd_Document.hxx>

namespace VizBridgeStep {

/// A new XCAF document of Open CASCADE's application, emptied and closed when this goes. The
/// application keeps every document it made, a document holds itself through its own data,
/// and GD&T attributes hold each other: without both steps, none of them is ever freed.
///
/// The first one sets up what Open CASCADE needs for the whole process to read and write STEP
/// into XCAF (the controllers and their parameters, the application and its driver table),
/// which it keeps for the life of the process and never frees.
class XcafDocument {
public:
    XcafDocument();
    ~XcafDocument();
    XcafDocument(XcafDocument const&) = delete;
    XcafDocument& operator=(XcafDocument const&) = delete;

    Handle(TDocStd_Document) Get() const { return m_document; }

private:
    Handle(TDocStd_Document) m_document;
};

} // namespace VizBridgeStep

#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <Standard_Handle.hxx>
#include <TCollection_AsciiString.hxx>
#include <TCollection_ExtendedString.hxx>
#include <TCollection_HAsciiString.hxx>
#include <TDF_Label.hxx>

#include <string>

// Texts of Open CASCADE as the import library's 16-bit texts and as narrow ones.

namespace VizBridgeStep {

VizPort::WString Wide(TCollection_ExtendedString const& text);
/// Bytes one to one: STEP strings are ISO 8859-1 after the reader's decoding.
VizPort::WString Wide(Handle(TCollection_HAsciiString) const& text);
std::string Narrow(Handle(TCollection_HAsciiString) const& text);
/// The name attribute of `label`; empty when it has none.
VizPort::WString LabelName(TDF_Label const& label);

} // namespace VizBridgeStep

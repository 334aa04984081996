#include <VizBridge/stepinput/StepText.h>

#include <TDataStd_Name.hxx>

namespace VizBridgeStep {

VizPort::WString Wide(TCollection_ExtendedString const& text) {
    VizPort::WString out;
    out.reserve(static_cast<std::size_t>(text.Length()));
    for (int i = 1; i <= text.Length(); ++i)
        out += static_cast<char16_t>(text.Value(i));
    return out;
}

VizPort::WString Wide(Handle(TCollection_HAsciiString) const& text) {
    return text.IsNull() ? VizPort::WString() : VizPort::Widen(text->ToCString());
}

std::string Narrow(Handle(TCollection_HAsciiString) const& text) {
    return text.IsNull() ? std::string() : std::string(text->ToCString());
}

VizPort::WString LabelName(TDF_Label const& label) {
    Handle(TDataStd_Name) name;
    if (label.IsNull() || !label.FindAttribute(TDataStd_Name::GetID(), name))
        return VizPort::WString();
    return Wide(name->Get());
}

} // namespace VizBridgeStep

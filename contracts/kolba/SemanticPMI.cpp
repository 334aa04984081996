#include <VizBridge/contracts/kolba/SemanticPMI.h>

namespace KolbaVizCore {

namespace {

void appendLine(VizPort::WString& text, VizPort::WString const& key,
                VizPort::WString const& value) {
    text += key;
    text += u" : ";
    text += value;
    text += u'\n';
}

} // namespace

VizPort::WString SemanticPMI::ToString() const {
    VizPort::WString text;
    appendLine(text, u"Name", Name);
    appendLine(text, u"Label", Label);
    appendLine(text, u"ID", ID);
    for (auto const& [key, value] : Properties)
        appendLine(text, key, value);
    return text;
}

} // namespace KolbaVizCore

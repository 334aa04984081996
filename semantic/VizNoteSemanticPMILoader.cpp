#include <VizBridge/semantic/VizNoteSemanticPMILoader.h>

#include <VizBridge/contracts/tarvex/TarvexPMINoteTextIter.h>
#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizNoteSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    auto const& note = object<TarvexPMINote>();
    TarvexPMINoteTextIter texts = note.GetTextIterator();
    while (texts.Next()) {
        TarvexPMINote::Text const text = texts.Current();
        m_record->Label = ToWString(text.text);
        write(u"FontName", ToWString(text.fontName));
        write(u"FontType", FontToText(text.font));
        write(u"FixedPitch", FormatBool(text.fixedPitch));
        write(u"Height", FormatFloat(text.height));
        write(u"Bold", FormatBool(text.bold));
        write(u"Italic", FormatBool(text.italic));
        write(u"Underline", FormatBool(text.underline));
        write(u"StrikeThrough", FormatBool(text.strikeThrough));
        write(u"Overline", FormatBool(text.overline));
        write(u"Ratio", FormatFloat(text.ratio));
        write(u"Slant", FormatFloat(text.slant));
        write(u"RGBAColor", FormatDoubles(4, text.color));
    }
    write(u"Flag Note", FormatBool(note.IsFlagNote()));
}

} // namespace VizBridgeTarvex

#include <VizBridge/contracts/tarvex/TarvexPMINote.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMINoteTextIter.h>

TarvexPMINote::TarvexPMINote(TarvexVisuContext context,
                             std::shared_ptr<TarvexAuthoredPMINote const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexPMIAnnotationType TarvexPMINote::GetObjectType() const {
    auto const* record = read<TarvexAuthoredPMINote>("TarvexPMIAnnotation::GetObjectType");
    if (record &&
        (record->objectType == TarvexPMI_FlagNote || record->objectType == TarvexPMI_NOA)) {
        return record->objectType;
    }
    return TarvexPMI_Note;
}

TarvexPMINoteTextIter TarvexPMINote::GetTextIterator() const {
    auto const* record = read<TarvexAuthoredPMINote>("TarvexPMINote::GetTextIterator");
    return record ? TarvexPMINoteTextIter(context(), share(record->texts))
                  : TarvexPMINoteTextIter();
}

bool TarvexPMINote::IsFlagNote() const {
    auto const* record = read<TarvexAuthoredPMINote>("TarvexPMINote::IsFlagNote");
    return record && record->flagNote;
}

TarvexPMINote::Text
TarvexPMINoteTextIter::MakeItem(TarvexVisuContext const&,
                                std::shared_ptr<TarvexAuthoredPMINoteText const> const& text) {
    TarvexPMINote::Text item;
    item.text = TarvexWString(text->text);
    item.fontName = TarvexWString(text->fontName);
    item.font = text->font;
    item.fixedPitch = text->fixedPitch;
    item.height = text->height;
    item.bold = text->bold;
    item.italic = text->italic;
    item.underline = text->underline;
    item.strikeThrough = text->strikeThrough;
    item.overline = text->overline;
    item.ratio = text->ratio;
    item.slant = text->slant;
    for (int channel = 0; channel < 4; ++channel) {
        item.color[channel] = text->color[static_cast<std::size_t>(channel)];
    }
    return item;
}

#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

class TarvexPMINoteTextIter;
struct TarvexAuthoredPMINote;

/// A note, a flag note or a note of the kind NOA: texts, each with its font.
class TarvexPMINote : public TarvexPMIAnnotation {
public:
    /// One text of a note, handed out by value.
    struct Text {
        TarvexWString text;
        TarvexWString fontName;
        TarvexPMIFont font = TarvexPMI_Simplex;
        bool fixedPitch = false;
        float height = 0;
        bool bold = false;
        bool italic = false;
        bool underline = false;
        bool strikeThrough = false;
        bool overline = false;
        float ratio = 1;
        float slant = 0;
        double color[4] = {0, 0, 0, 1}; ///< red, green, blue, alpha
    };

    TarvexPMINote() = default;
    TarvexPMINote(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredPMINote const> record);

    /// TarvexPMI_Note, TarvexPMI_FlagNote or TarvexPMI_NOA.
    TarvexPMIAnnotationType GetObjectType() const override;
    TarvexPMINoteTextIter GetTextIterator() const;
    bool IsFlagNote() const;
};

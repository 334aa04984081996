#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuBuild2DTextResult.h>

class TarvexVisuFont;
class TarvexVisuText;

/// Turns a text into geometry: the outlines of its glyphs as strokes, and the glyphs filled
/// as triangles, from a real font (see TarvexFontCache for how a font name picks its file).
///
/// Layout: the text starts at its anchor and runs along its direction, made perpendicular to
/// its normal; the first baseline passes through the anchor, and each further line ("\n")
/// stands one line spacing of the font below the one before. Capital letters are the font's text
/// height tall; the width scaling factor stretches glyphs and advances along the direction, and the
/// spacing factor stretches the advances alone. Absent font values count as 1, an absent name as
/// the default font. Filled faces face the normal, and every vertex carries it.
///
/// A text whose document holds its glyphs already laid out (TarvexAuthoredVisuGlyphs) is not
/// laid out again: its glyphs come back as they are, whatever its string, placement and font.
/// Stateless.
class TarvexVisu2DTextBuilder {
public:
    /// Throws std::invalid_argument for a text it cannot lay out: no text or an empty one; a
    /// height, width scaling or spacing factor that is not a positive finite number; an anchor,
    /// direction or normal that is not finite; a zero normal; a direction that is zero or
    /// runs along the normal; a text of no model. Throws std::runtime_error for a font file
    /// that cannot be read. For a text with glyphs: throws std::invalid_argument for a glyph
    /// whose indices fall outside its coordinates, as readers follow them unchecked.
    /// And whatever the model's fault plan has planned for the text's reference.
    TarvexVisuBuild2DTextResult Build2DText(TarvexVisuText const& text,
                                            TarvexVisuFont const& font) const;
};

#pragma once

#include <VizBridge/contracts/kolba/AVizTextLoader.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuBuild2DTextResult.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuText.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <functional>
#include <vector>

namespace VizBridgeTarvex {

/// Loads one text of a PMI as real text: its colour (a missing colour or alpha always looked
/// up in the stack), its font (its own, else the nearest of the stack, else a default one),
/// the font's size, spacing and width scaling (1 where the font has none, unscaled), the
/// string, and where it stands.
class VizTextLoader : public VizSourceLoader<KolbaVizCore::AVizTextLoader, TarvexVisuText> {
public:
    /// `attributes` may be null. `inheritAttributes` is kept like every loader's flag, but a
    /// text inherits its colour and font from the stack whatever it says.
    VizTextLoader(TarvexVisuText const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizTextLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

/// Fills `font` from the newest entry of the attribute stack that has a font, and answers
/// whether one had. `font` stays as it was when none has, or when `attributes` is null.
bool findInheritedFont(std::vector<TarvexVisuAttributes> const* attributes, TarvexVisuFont& font);

/// Turns `source` into geometry with the import library's text builder and `font`: the glyph
/// outlines become edges (opaque, colour by the stack) and the filled glyphs faces. True if at
/// least one piece was made. `edges` and `faces` must come in empty. On true they hold the
/// pieces, which cross to the caller, who must free or hand on each; on false they are empty
/// again. Never throws: a failure of the builder or of a loader, of any kind, counts as no
/// geometry, every piece made before it is freed, and the reason goes to the debug output as
/// "Failed to Tesselate Text: <reason>".
bool tesselateText(TarvexVisuText const& source, TarvexVisuFont const& font,
                   std::vector<TarvexVisuAttributes>* attributes,
                   std::vector<KolbaVizCore::VizEdge*>& edges,
                   std::vector<KolbaVizCore::VizFace*>& faces);

/// tesselateText with the builder's work given as `build`, which gives the laid-out text. The
/// same contract: whatever `build` throws counts as no geometry.
bool tesselateText(std::function<TarvexVisuBuild2DTextResult()> const& build,
                   std::vector<TarvexVisuAttributes>* attributes,
                   std::vector<KolbaVizCore::VizEdge*>& edges,
                   std::vector<KolbaVizCore::VizFace*>& faces);

} // namespace VizBridgeTarvex

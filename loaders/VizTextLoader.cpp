#include "loaders/VizTextLoader.h"

#include "contracts/kolba/RGBAColor.h"
#include "contracts/kolba/VizText.h"
#include "contracts/tarvex/TarvexVisu2DTextBuilder.h"
#include "contracts/tarvex/TarvexVisuEdge.h"
#include "contracts/tarvex/TarvexVisuEdgeIter.h"
#include "contracts/tarvex/TarvexVisuFace.h"
#include "contracts/tarvex/TarvexVisuFaceIter.h"
#include "contracts/tarvex/TarvexWString.h"
#include "loaders/LoadAs.h"
#include "loaders/VisuColor.h"
#include "loaders/VizEdgeLoader.h"
#include "loaders/VizFaceLoader.h"

#include <memory>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizText;

namespace {

/// Appends what `piece` holds to `pieces`, which takes it over; a null piece is left out.
template <class Piece> void appendPiece(std::unique_ptr<Piece> piece, std::vector<Piece*>& pieces) {
    if (!piece)
        return;
    pieces.push_back(piece.get()); // may throw: `piece` still frees it then
    static_cast<void>(piece.release());
}

template <class Piece> void freePieces(std::vector<Piece*>& pieces) {
    for (Piece* const piece : pieces)
        std::unique_ptr<Piece> const released(piece); // the pieces were never handed out
    pieces.clear();
}

} // namespace

VizTextLoader::VizTextLoader(TarvexVisuText const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizTextLoader::loadOne() {
    auto* const text = dynamic_cast<VizText*>(makeOne());
    if (text == nullptr)
        return nullptr;

    // A text shows the colour of the nodes above it unless it has its own.
    KolbaVizCore::RGBAColor color;
    if (resolveVisuColor(*m_source, m_attributes, color, true))
        text->SetColor(color);

    TarvexVisuFont font;
    if (!m_source->GetFont(font) && m_attributes != nullptr)
        findInheritedFont(m_attributes, font);
    // A default font gives its name too: the renderer picks its own face for an empty one.
    text->SetFontName(font.GetFontName().ToWString());
    // The getters leave the 1.0 in place when the font lacks the value.
    float height = 1.0f;
    font.GetTextHeight(height);
    text->SetFontSize(height);
    float spacing = 1.0f;
    font.GetSpacingFactor(spacing);
    text->SetSpacingFactor(spacing);
    float widthScaling = 1.0f;
    font.GetWidthScalingFactor(widthScaling);
    text->SetWidthScaling(widthScaling);

    float anchor[3] = {0.0f, 0.0f, 0.0f};
    float direction[3] = {1.0f, 0.0f, 0.0f};
    float normal[3] = {0.0f, 0.0f, 1.0f};
    TarvexWString const string = m_source->GetTextString(anchor, direction, normal);
    text->SetText(string.ToWString());
    text->SetAnchorPoint(anchor);
    text->SetDirection(direction);
    text->SetNormal(normal);
    return text;
}

bool findInheritedFont(std::vector<TarvexVisuAttributes> const* const attributes,
                       TarvexVisuFont& font) {
    if (attributes == nullptr)
        return false;
    for (auto entry = attributes->rbegin(); entry != attributes->rend(); ++entry)
        if (entry->GetFont(font))
            return true;
    return false;
}

bool tesselateText(TarvexVisuText const& source, TarvexVisuFont const& font,
                   std::vector<TarvexVisuAttributes>* attributes, std::vector<VizEdge*>& edges,
                   std::vector<VizFace*>& faces) {
    return tesselateText(
        [&source, &font] { return TarvexVisu2DTextBuilder().Build2DText(source, font); },
        attributes, edges, faces);
}

bool tesselateText(std::function<TarvexVisuBuild2DTextResult()> const& build,
                   std::vector<TarvexVisuAttributes>* attributes, std::vector<VizEdge*>& edges,
                   std::vector<VizFace*>& faces) {
    bool made = false;
    // The caller shows a notice in place of a text that could not become geometry, so a
    // failure of any kind, even one no std::exception describes, ends here.
    try {
        TarvexVisuBuild2DTextResult const built = build();

        TarvexVisuEdgeIter strokes = built.GetStrokedFontTextIterator();
        while (strokes.Next()) {
            TarvexVisuEdge const stroke = strokes.Current();
            VizEdgeLoader loader(stroke, attributes, true);
            std::unique_ptr<VizEdge> edge = loadAs<VizEdge>(loader);
            // PMI lines are drawn opaque, the strokes of its texts too.
            if (edge)
                edge->RemoveTransparency();
            appendPiece(std::move(edge), edges);
        }

        TarvexVisuFaceIter filled = built.GetFilledFontTextIterator();
        while (filled.Next()) {
            TarvexVisuFace const shape = filled.Current();
            VizFaceLoader loader(shape, attributes, true);
            appendPiece(loadAs<VizFace>(loader), faces);
        }

        made = !edges.empty() || !faces.empty();
    } catch (...) {
        made = false;
    }
    // Half a text is not shown: what was made before a failure goes.
    if (!made) {
        freePieces(edges);
        freePieces(faces);
    }
    return made;
}

} // namespace VizBridgeTarvex

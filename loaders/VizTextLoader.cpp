#include <VizBridge/loaders/VizTextLoader.h>

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/platform/DebugOutput.h>
#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/contracts/tarvex/TarvexVisu2DTextBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFace.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFaceIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VisuColor.h>
#include <VizBridge/loaders/VizEdgeLoader.h>
#include <VizBridge/loaders/VizFaceLoader.h>

#include <exception>
#include <memory>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizText;

namespace {

void reportTessellationFailure(VizPort::WString const& reason) {
    VizPort::WString const text =
        VizPort::FormatW(512, u"Failed to Tesselate Text: %s", {reason.c_str()});
    VizPort::OutputDebugStringW(text.c_str());
}

} // namespace

VizTextLoader::VizTextLoader(TarvexVisuText const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

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
    text->SetFontName(textOrEmpty(font.GetFontName()));
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
    text->SetText(textOrEmpty(string));
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
    // Held here until the whole text is made: half a text is not shown.
    std::vector<std::unique_ptr<VizEdge>> strokes;
    std::vector<std::unique_ptr<VizFace>> shapes;
    // The caller shows a notice in place of a text that could not become geometry, so a
    // failure of any kind, even one no std::exception describes, ends here; the reason goes
    // to the debug output, where a host that set up the text builder wrongly finds it.
    try {
        TarvexVisuBuild2DTextResult const built = build();

        TarvexVisuEdgeIter strokeSources = built.GetStrokedFontTextIterator();
        while (strokeSources.Next()) {
            TarvexVisuEdge const stroke = strokeSources.Current();
            VizEdgeLoader loader(stroke, attributes, true);
            if (std::unique_ptr<VizEdge> edge = loadAs<VizEdge>(loader)) {
                edge->RemoveTransparency(); // PMI lines are drawn opaque, its texts' too
                strokes.push_back(std::move(edge));
            }
        }

        TarvexVisuFaceIter shapeSources = built.GetFilledFontTextIterator();
        while (shapeSources.Next()) {
            TarvexVisuFace const shape = shapeSources.Current();
            VizFaceLoader loader(shape, attributes, true);
            if (std::unique_ptr<VizFace> face = loadAs<VizFace>(loader))
                shapes.push_back(std::move(face));
        }
        edges.reserve(strokes.size());
        faces.reserve(shapes.size());
    } catch (std::exception const& e) {
        reportTessellationFailure(VizPort::Widen(e.what() ? e.what() : ""));
        return false;
    } catch (...) {
        reportTessellationFailure(u"unknown exception");
        return false;
    }
    if (strokes.empty() && shapes.empty())
        return false;
    // Reserved above: handing the pieces across cannot fail.
    for (std::unique_ptr<VizEdge>& edge : strokes)
        edges.push_back(edge.release());
    for (std::unique_ptr<VizFace>& face : shapes)
        faces.push_back(face.release());
    return true;
}

} // namespace VizBridgeTarvex

#include <VizBridge/loaders/VizPMILoader.h>

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIType.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuText.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/PMITypeMapping.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VizEdgeLoader.h>
#include <VizBridge/loaders/VizTextLoader.h>

#include <memory>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPMIType;
using KolbaVizCore::VizText;

namespace {

VizPMIType pmiTypeOf(TarvexVisuNode::TarvexVisuNodeType const nodeType) {
    VizPMIType::ID const id = GetVizPMITypeFromVisuNodeType(nodeType);
    return VizPMIType(id, TarvexVisuNode::NodeTypeAsString(nodeType),
                      GetEntityTypeFromVizPMIType(id));
}

} // namespace

VizPMILoader::VizPMILoader(TarvexVisuPMI const& source,
                           std::vector<TarvexVisuAttributes>* attributes,
                           TarvexVisuNode::TarvexVisuNodeType const& nodeTypeForGroup,
                           TarvexVisuNode::TarvexVisuNodeType const& nodeType,
                           bool const& tesselateText)
    : m_groupNodeType(GetVisuPMIGroupTypeFromVisuNodeType(nodeTypeForGroup)), m_nodeType(nodeType),
      m_tesselateText(tesselateText), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizPMILoader::loadOne() {
    // A PMI is made with its group and type and never gets them afterwards.
    setGroupAndType(pmiTypeOf(m_groupNodeType), pmiTypeOf(m_nodeType));
    auto* const pmi = dynamic_cast<VizPMI*>(makeOne());
    if (pmi == nullptr)
        return nullptr;

    loadEdges(*pmi);
    loadTexts(*pmi);
    // Nothing to draw, nothing to pick: the PMI leaves no trace, and the run frees it.
    if (pmi->GetEdges().empty() && pmi->GetFaces().empty() && pmi->GetTexts().empty())
        return nullptr;

    pmi->SetName(textOrEmpty(m_source->GetDisplayName()));
    TarvexWString id;
    if (m_source->GetID(id))
        pmi->SetVisualID(textOrEmpty(id));
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        pmi->SetMechanicalID(textOrEmpty(mechanicalId));
    loadLinkedEntityIDs(*pmi);
    // Only ever hides: the node's own attributes may still show it afterwards.
    if (isHiddenByStack())
        pmi->SetHidden(true);
    return pmi;
}

void VizPMILoader::loadEdges(VizPMI& pmi) const {
    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    pmi.SetEdgeCountHint(countHint(edges.GetCount()));
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        VizEdgeLoader loader(source, m_attributes, true);
        if (std::unique_ptr<VizEdge> edge = loadAs<VizEdge>(loader)) {
            // PMI is drawn opaque.
            edge->RemoveTransparency();
            handOver(std::move(edge), [&pmi](VizEdge* const piece) { pmi.AddEdge(piece); });
        }
    }
}

void VizPMILoader::loadTexts(VizPMI& pmi) const {
    TarvexVisuTextIter texts = m_source->GetTextIterator();
    pmi.SetTextCountHint(countHint(texts.GetCount()));
    while (texts.Next()) {
        TarvexVisuText const source = texts.Current();
        VizTextLoader loader(source, m_attributes, true);
        std::unique_ptr<VizText> text = loadAs<VizText>(loader);
        if (!text)
            continue;
        text->RemoveTransparency();
        if (text->GetText().empty())
            continue;
        auto const addText = [&pmi](VizText* const piece) { pmi.AddText(piece); };
        if (!m_tesselateText) {
            handOver(std::move(text), addText);
            continue;
        }

        // The builder gets the stack's font, never the text's own.
        TarvexVisuFont font;
        if (m_attributes != nullptr)
            findInheritedFont(m_attributes, font);
        std::vector<VizEdge*> strokes;
        std::vector<VizFace*> shapes;
        if (tesselateText(source, font, m_attributes, strokes, shapes)) {
            // Taken over before anything else can throw.
            std::vector<std::unique_ptr<VizEdge>> ownedStrokes = adoptAll(strokes);
            std::vector<std::unique_ptr<VizFace>> ownedShapes = adoptAll(shapes);
            handOverAll(ownedStrokes, [&pmi](VizEdge* const edge) { pmi.AddEdge(edge); });
            handOverAll(ownedShapes, [&pmi](VizFace* const face) { pmi.AddFace(face); });
            continue; // the geometry stands for the text, which goes
        }
        // Shown in the text's place, so that a reader sees that something is missing.
        text->SetText(u"Failed to Tesselate Text!");
        text->SetColor(KolbaVizCore::RGBAColor(255, 255, 0, 255));
        handOver(std::move(text), addText);
    }
}

void VizPMILoader::loadLinkedEntityIDs(VizPMI& pmi) const {
    std::vector<VizPort::WString> ids;
    TarvexEntityIter entities = m_source->GetLinkedElementIterator();
    while (entities.Next()) {
        TarvexEntity const entity = entities.Current();
        // Only part entities are shown by an element of this part's data.
        TarvexVisuEntity partEntity;
        TarvexWString id;
        if (entity.GetPartEntity(partEntity) && partEntity.GetID(id))
            ids.push_back(textOrEmpty(id));
    }
    pmi.SetLinkedEntityIDs(ids);
}

bool VizPMILoader::isHiddenByStack() const {
    if (m_attributes == nullptr)
        return false;
    // From the oldest entry: a node that hides hides all below it, and a "shown" below it
    // does not undo that.
    for (TarvexVisuAttributes const& entry : *m_attributes) {
        bool hidden = false;
        if (entry.GetHidden(hidden) && hidden)
            return true;
    }
    return false;
}

} // namespace VizBridgeTarvex

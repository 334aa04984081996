#include "loaders/VizPMILoader.h"

#include "contracts/kolba/RGBAColor.h"
#include "contracts/kolba/VizEdge.h"
#include "contracts/kolba/VizFace.h"
#include "contracts/kolba/VizPMI.h"
#include "contracts/kolba/VizPMIType.h"
#include "contracts/kolba/VizText.h"
#include "contracts/platform/WString.h"
#include "contracts/tarvex/TarvexEntity.h"
#include "contracts/tarvex/TarvexEntityIter.h"
#include "contracts/tarvex/TarvexVisuEdge.h"
#include "contracts/tarvex/TarvexVisuEdgeIter.h"
#include "contracts/tarvex/TarvexVisuEntity.h"
#include "contracts/tarvex/TarvexVisuFont.h"
#include "contracts/tarvex/TarvexVisuText.h"
#include "contracts/tarvex/TarvexVisuTextIter.h"
#include "contracts/tarvex/TarvexWString.h"
#include "loaders/LoadAs.h"
#include "loaders/PMITypeMapping.h"
#include "loaders/VizEdgeLoader.h"
#include "loaders/VizTextLoader.h"

#include <memory>
#include <utility>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPMIType;
using KolbaVizCore::VizText;

namespace {

unsigned int countOf(int const count) {
    return count > 0 ? static_cast<unsigned int>(count) : 0u;
}

VizPMIType pmiTypeOf(TarvexVisuNode::TarvexVisuNodeType const nodeType) {
    VizPMIType::ID const id = GetVizPMITypeFromVisuNodeType(nodeType);
    return VizPMIType(id, TarvexVisuNode::NodeTypeAsString(nodeType),
                      GetEntityTypeFromVizPMIType(id));
}

/// The pieces of one tessellated text, which cross from tesselateText as raw pointers: freed
/// here unless handed on, also when handing them on fails halfway.
template <class Piece> class TextPieces {
public:
    TextPieces() = default;
    TextPieces(TextPieces const&) = delete;
    TextPieces& operator=(TextPieces const&) = delete;
    ~TextPieces() {
        for (Piece* const piece : m_items)
            std::unique_ptr<Piece> const released(piece);
    }

    std::vector<Piece*>& Items() { return m_items; }

    /// Gives every piece, in order, to `add`, which takes it over.
    template <class Add> void HandOver(Add const& add) {
        for (Piece*& piece : m_items)
            add(std::exchange(piece, nullptr));
        m_items.clear();
    }

private:
    std::vector<Piece*> m_items; ///< owned
};

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

    pmi->SetName(m_source->GetDisplayName().ToWString());
    TarvexWString id;
    if (m_source->GetID(id))
        pmi->SetVisualID(id.ToWString());
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        pmi->SetMechanicalID(mechanicalId.ToWString());
    loadLinkedEntityIDs(*pmi);
    // Only ever hides: the node's own attributes may still show it afterwards.
    if (isHiddenByStack())
        pmi->SetHidden(true);
    return pmi;
}

void VizPMILoader::loadEdges(VizPMI& pmi) const {
    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    pmi.SetEdgeCountHint(countOf(edges.GetCount()));
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        VizEdgeLoader loader(source, m_attributes, true);
        if (std::unique_ptr<VizEdge> edge = loadAs<VizEdge>(loader)) {
            // PMI is drawn opaque.
            edge->RemoveTransparency();
            pmi.AddEdge(edge.release());
        }
    }
}

void VizPMILoader::loadTexts(VizPMI& pmi) const {
    TarvexVisuTextIter texts = m_source->GetTextIterator();
    pmi.SetTextCountHint(countOf(texts.GetCount()));
    while (texts.Next()) {
        TarvexVisuText const source = texts.Current();
        VizTextLoader loader(source, m_attributes, true);
        std::unique_ptr<VizText> text = loadAs<VizText>(loader);
        if (!text)
            continue;
        text->RemoveTransparency();
        if (text->GetText().empty())
            continue;
        if (!m_tesselateText) {
            pmi.AddText(text.release());
            continue;
        }

        // The builder gets the stack's font, never the text's own.
        TarvexVisuFont font;
        if (m_attributes != nullptr)
            findInheritedFont(m_attributes, font);
        TextPieces<VizEdge> strokes;
        TextPieces<VizFace> shapes;
        if (tesselateText(source, font, m_attributes, strokes.Items(), shapes.Items())) {
            strokes.HandOver([&pmi](VizEdge* const edge) { pmi.AddEdge(edge); });
            shapes.HandOver([&pmi](VizFace* const face) { pmi.AddFace(face); });
            continue; // the geometry stands for the text, which goes
        }
        // Shown in the text's place, so that a reader sees that something is missing.
        text->SetText(u"Failed to Tesselate Text!");
        text->SetColor(KolbaVizCore::RGBAColor(255, 255, 0, 255));
        pmi.AddText(text.release());
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
            ids.push_back(id.ToWString());
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

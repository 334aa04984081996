// The visualisation data of one reference: its import, the conversion of its flat node list
// into a VizContainer and a VizPMIContainer, and the linking of PMI to mechanical ids.
#include <VizBridge/contracts/kolba/Stopwatch.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCaptureIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNodeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuViewIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>
#include <VizBridge/import/BuilderErrors.h>
#include <VizBridge/import/VisuIdMapJournal.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VizCaptureLoader.h>
#include <VizBridge/loaders/VizMeshLoader.h>
#include <VizBridge/loaders/VizPMILoader.h>
#include <VizBridge/loaders/VizPointSetLoader.h>
#include <VizBridge/loaders/VizViewLoader.h>
#include <VizBridge/loaders/VizWireLoader.h>
#include <VizBridge/model/VizProductStructure.h>

#include <exception>
#include <memory>

namespace VizBridgeTarvex {

using namespace BuilderErrors;
using KolbaVizCore::VizCapture;
using KolbaVizCore::VizMesh;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPointSet;
using KolbaVizCore::VizView;
using KolbaVizCore::VizWire;

namespace {

/// The unit that the containers' scale factor converts to.
constexpr TarvexLengthUnitType kContainerUnit = TarvexLengthUnit_Millimeter;

/// The three lists a kind of geometry goes to, by geometry type.
template <class Element> struct GeometryLists {
    void (VizContainer::*plain)(Element*);
    void (VizContainer::*constructed)(Element*);
    void (KolbaVizCore::VizPMIContainer::*fta)(Element*);
};

/// Loads a mesh, wire or point set leaf into the lists its geometry type chooses, and
/// returns the leaf's top element (null if nothing was loaded). FTA constructed geometry is
/// loaded twice when both containers are there: the first element, which stands in no list,
/// goes to `unlisted`. `enterIds` sees each element loaded for the VizContainer.
template <class Element, class Loader, class Source, class EnterIds>
VizElement* loadGeometryLeaf(Source const& source, std::vector<TarvexVisuAttributes>& attributes,
                             VizContainer* vizContainer, VizPMIContainer* pmiContainer,
                             GeometryLists<Element> const& lists, EnterIds const& enterIds,
                             std::vector<std::unique_ptr<VizElement>>& unlisted) {
    int const geometryType = source.GetGeometryType();
    Loader loader(source, &attributes, false);
    VizElement* leaf = nullptr;
    if (vizContainer) {
        if (std::unique_ptr<Element> element = loadAs<Element>(loader)) {
            enterIds(*element);
            leaf = element.get();
            if (geometryType == TarvexVisuGeometry_FTAConstructed) {
                unlisted.push_back(std::move(element));
            } else {
                auto const list = geometryType == TarvexVisuGeometry_Constructed ? lists.constructed
                                                                                 : lists.plain;
                handOver(std::move(element), [vizContainer, list](Element* const piece) {
                    (vizContainer->*list)(piece);
                });
            }
        }
    }
    if (pmiContainer && geometryType == TarvexVisuGeometry_FTAConstructed) {
        if (std::unique_ptr<Element> element = loadAs<Element>(loader))
            leaf = handOver(std::move(element), [pmiContainer, &lists](Element* const piece) {
                (pmiContainer->*lists.fta)(piece);
            });
    }
    return leaf;
}

} // namespace

void VizBuilder::importVisuDataFromReference(TarvexInputPSReference const& reference) {
    int id = 0;
    try {
        // Read inside the guard, as for the BREP: a reference that cannot even be read
        // costs only itself.
        id = static_cast<int>(reference.GetUniqueID());
        WString const name = textOrEmpty(reference.GetReferenceName());
        TarvexPartDocument const document = reference.GetDocument();

        KolbaVizCore::Stopwatch stopwatch;
        stopwatch.Start();
        TarvexVisualizationImporter const importer;
        TarvexVisuImportResult const result =
            m_policy ? importer.ImportWithPolicy(*m_policy, document) : importer.Import(document);
        TarvexVisuData const data = result.GetVisualizationData();
        stopwatch.Stop();
        m_totalImportGeomTime += stopwatch.GetElapsedTime();

        VizContainer* madeViz = nullptr;
        VizPMIContainer* madePMI = nullptr;
        importGraphicalContainer(id, data, madeViz, madePMI);
        std::unique_ptr<VizContainer> vizContainer(madeViz); // handed to this call
        std::unique_ptr<VizPMIContainer> pmiContainer(madePMI);
        if (!vizContainer && !pmiContainer)
            m_productStructure.setVisuError(id, u"Could not Import VisuData from " + name);
        if (vizContainer)
            m_productStructure.AddVizContainer(id, std::move(vizContainer));
        if (pmiContainer)
            m_productStructure.AddVizPMIContainer(id, std::move(pmiContainer));
    } catch (...) {
        m_productStructure.setVisuError(id, describeCurrentFailure(kVisuDataImportSite, id).text);
    }
}

void VizBuilder::importGraphicalContainer(int const& referenceId,
                                          TarvexVisualizationData const& data,
                                          VizContainer*& vizContainer,
                                          VizPMIContainer*& pmiContainer) {
    double const scale = TarvexLengthUnitUtils::GetScalingFactor(data.GetUnits(), kContainerUnit);
    std::unique_ptr<VizContainer> viz;
    std::unique_ptr<VizPMIContainer> pmi;
    if (m_importVisu) {
        viz = std::make_unique<VizContainer>(referenceId);
        viz->SetScaleFactor(static_cast<float>(scale));
    }
    if (m_importPMI) {
        pmi = std::make_unique<VizPMIContainer>(referenceId);
        pmi->SetScaleFactor(scale);
    }
    if (!viz && !pmi)
        return;

    VisuIdMapJournal journal(m_visuIdMap);
    {
        // The walk is flat: a group's attributes stay on the stack until the walk ends.
        std::vector<TarvexVisuAttributes> attributes;
        TarvexVisuNodeIter nodes = data.GetNodeIterator();
        while (nodes.Next()) {
            TarvexVisuNode const node = nodes.Current();
            TarvexVisuNode::TarvexVisuNodeType const type = node.GetType();
            bool const leaf = node.IsLeaf();
            attributes.push_back(node.GetAttributes());
            if (leaf) {
                processVizLeaf(viz.get(), pmi.get(), node, attributes, type, journal);
                attributes.pop_back();
            }
        }
    }

    // Views and captures have nowhere to go without a PMI container: they are not loaded.
    if (pmi) {
        TarvexVisuViewIter views = data.GetViewIterator();
        while (views.Next()) {
            TarvexVisuView const source = views.Current();
            VizViewLoader loader(source, nullptr, false);
            if (std::unique_ptr<VizView> view = loadAs<VizView>(loader))
                handOver(std::move(view), [&pmi](VizView* const piece) { pmi->AddView(piece); });
        }
        TarvexVisuCaptureIter captures = data.GetCaptureIterator();
        while (captures.Next()) {
            TarvexVisuCapture const source = captures.Current();
            VizCaptureLoader loader(source, nullptr, false);
            if (std::unique_ptr<VizCapture> capture = loadAs<VizCapture>(loader))
                handOver(std::move(capture),
                         [&pmi](VizCapture* const piece) { pmi->AddCapture(piece); });
        }
    }
    FillVizPMIMechIDs(pmi.get());

    journal.Commit();
    // Handed to the caller, who files them.
    vizContainer = viz.release();
    pmiContainer = pmi.release();
}

void VizBuilder::processVizLeaf(VizContainer* vizContainer, VizPMIContainer* pmiContainer,
                                TarvexVisuNode const& node,
                                std::vector<TarvexVisuAttributes>& attributes,
                                TarvexVisuNode::TarvexVisuNodeType const& nodeType,
                                VisuIdMapJournal& journal) {
    VizElement* element = nullptr;
    int const type = node.GetType();
    auto const noIds = [](VizElement const&) {};
    if (type == TarvexVisuNode::VisuMesh) {
        auto const enterMeshIds = [&journal](VizMesh& mesh) {
            std::map<WString, VizElement*> entries;
            mesh.FillVisuIdMap(entries);
            journal.Merge(entries);
        };
        element = loadGeometryLeaf<VizMesh, VizMeshLoader>(
            node.GetMesh(), attributes, vizContainer, pmiContainer,
            GeometryLists<VizMesh>{&VizContainer::AddMesh, &VizContainer::AddCGMesh,
                                   &VizPMIContainer::AddVizFTACGMesh},
            enterMeshIds, *m_unlistedElements);
    } else if (type == TarvexVisuNode::VisuWire) {
        element = loadGeometryLeaf<VizWire, VizWireLoader>(
            node.GetWire(), attributes, vizContainer, pmiContainer,
            GeometryLists<VizWire>{&VizContainer::AddWire, &VizContainer::AddCGWire,
                                   &VizPMIContainer::AddVizFTACGWire},
            noIds, *m_unlistedElements);
    } else if (type == TarvexVisuNode::VisuPointSet) {
        element = loadGeometryLeaf<VizPointSet, VizPointSetLoader>(
            node.GetPointSet(), attributes, vizContainer, pmiContainer,
            GeometryLists<VizPointSet>{&VizContainer::AddPointSet, &VizContainer::AddCGPointSet,
                                       &VizPMIContainer::AddVizFTACGPointSet},
            noIds, *m_unlistedElements);
    } else if (pmiContainer) {
        TarvexVisuPMI const source = node.GetPMI();
        bool const tesselate = m_productStructure.IsTesselatingText(); // read anew per leaf
        VizPMILoader loader(source, &attributes, nodeType, node.GetType(), tesselate);
        if (std::unique_ptr<VizPMI> pmi = loadAs<VizPMI>(loader)) {
            journal.Set(pmi->GetVisualID(), pmi.get());
            element = handOver(std::move(pmi), [pmiContainer](VizPMI* const piece) {
                pmiContainer->AddVizPMI(piece);
            });
        }
    }

    if (!element || attributes.empty())
        return;
    // The node's own attributes reach its top element, whatever its kind.
    TarvexVisuAttributes const own = node.GetAttributes();
    bool hidden = false;
    if (own.GetHidden(hidden))
        element->SetHidden(hidden);
    RGBAColor color;
    unsigned short red = 0, green = 0, blue = 0, alpha = 255;
    bool const hasRGB = own.GetRGBColor(red, green, blue);
    bool const hasAlpha = own.GetAlphaColor(alpha);
    if (hasRGB)
        color = RGBAColor(colorByte(red), colorByte(green), colorByte(blue), 255);
    if (hasAlpha)
        color.alpha = colorByte(alpha);
    if (hasRGB || hasAlpha)
        element->SetColor(color);
}

VizElement* VizBuilder::GetVizElement(WString const& visualId) const {
    auto const found = m_visuIdMap.find(visualId);
    return found == m_visuIdMap.end() ? nullptr : found->second;
}

WString VizBuilder::GetVizElementMechID(WString const& visualId) const {
    VizElement const* const element = GetVizElement(visualId);
    if (!element)
        return WString();
    std::string const type = element->GetElementType();
    if (type == VizMesh::TypeID())
        return static_cast<VizMesh const*>(element)->GetMechanicalID();
    if (type == KolbaVizCore::VizFace::TypeID())
        return static_cast<KolbaVizCore::VizFace const*>(element)->GetMechanicalID();
    if (type == KolbaVizCore::VizEdge::TypeID())
        return static_cast<KolbaVizCore::VizEdge const*>(element)->GetMechanicalID();
    if (type == VizPMI::TypeID())
        return static_cast<VizPMI const*>(element)->GetMechanicalID();
    return WString();
}

void VizBuilder::FillVizPMIMechIDs(VizPMIContainer* container) const {
    if (!container)
        return;
    for (VizPMI* const pmi : container->GetVizPMIs()) {
        if (!pmi)
            continue;
        std::vector<WString> const linked = pmi->GetLinkedEntityIDs();
        std::vector<WString> mechanicalIds;
        mechanicalIds.reserve(linked.size());
        for (WString const& id : linked)
            mechanicalIds.push_back(GetVizElementMechID(id)); // empty when unresolved
        pmi->SetLinkedEntityMechIDs(mechanicalIds);
    }
}

} // namespace VizBridgeTarvex

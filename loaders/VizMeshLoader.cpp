#include <VizBridge/loaders/VizMeshLoader.h>

#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFaceIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VizEdgeLoader.h>
#include <VizBridge/loaders/VizFaceLoader.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizMesh;

VizMeshLoader::VizMeshLoader(TarvexVisuMesh const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizMeshLoader::loadOne() {
    auto* const mesh = dynamic_cast<VizMesh*>(makeOne());
    if (mesh == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        mesh->SetVisualID(textOrEmpty(id));
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        mesh->SetMechanicalID(textOrEmpty(mechanicalId));

    TarvexVisuFaceIter faces = m_source->GetFaceIterator();
    mesh->SetFaceCountHint(countHint(faces.GetCount()));
    while (faces.Next()) {
        TarvexVisuFace const source = faces.Current();
        VizFaceLoader loader(source, m_attributes, m_inheritAttributes);
        handOver(loadAs<VizFace>(loader), [mesh](VizFace* const face) { mesh->AddFace(face); });
    }

    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    mesh->SetEdgeCountHint(countHint(edges.GetCount()));
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        VizEdgeLoader loader(source, m_attributes, m_inheritAttributes);
        handOver(loadAs<VizEdge>(loader), [mesh](VizEdge* const edge) { mesh->AddEdge(edge); });
    }
    return mesh;
}

} // namespace VizBridgeTarvex

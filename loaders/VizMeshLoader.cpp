#include "loaders/VizMeshLoader.h"

#include "contracts/kolba/VizEdge.h"
#include "contracts/kolba/VizFace.h"
#include "contracts/kolba/VizMesh.h"
#include "contracts/tarvex/TarvexVisuEdgeIter.h"
#include "contracts/tarvex/TarvexVisuFaceIter.h"
#include "contracts/tarvex/TarvexWString.h"
#include "loaders/LoadAs.h"
#include "loaders/VizEdgeLoader.h"
#include "loaders/VizFaceLoader.h"

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizMesh;

namespace {

unsigned int countOf(int const count) {
    return count > 0 ? static_cast<unsigned int>(count) : 0u;
}

} // namespace

VizMeshLoader::VizMeshLoader(TarvexVisuMesh const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizMeshLoader::loadOne() {
    auto* const mesh = dynamic_cast<VizMesh*>(makeOne());
    if (mesh == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        mesh->SetVisualID(id.ToWString());
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        mesh->SetMechanicalID(mechanicalId.ToWString());

    TarvexVisuFaceIter faces = m_source->GetFaceIterator();
    mesh->SetFaceCountHint(countOf(faces.GetCount()));
    while (faces.Next()) {
        TarvexVisuFace const source = faces.Current();
        VizFaceLoader loader(source, m_attributes, m_inheritAttributes);
        mesh->AddFace(loadAs<VizFace>(loader).release());
    }

    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    mesh->SetEdgeCountHint(countOf(edges.GetCount()));
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        VizEdgeLoader loader(source, m_attributes, m_inheritAttributes);
        mesh->AddEdge(loadAs<VizEdge>(loader).release());
    }
    return mesh;
}

} // namespace VizBridgeTarvex

#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFaceIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Mesh = TarvexAuthoredVisuMesh;

bool TarvexVisuMesh::GetID(TarvexWString& id) const {
    Mesh const* const mesh = m_context.Read(m_record, "TarvexVisuMesh::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(mesh, &Mesh::id), id);
}

bool TarvexVisuMesh::GetMechanicalID(TarvexWString& id) const {
    Mesh const* const mesh = m_context.Read(m_record, "TarvexVisuMesh::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(mesh, &Mesh::mechanicalId), id);
}

TarvexVisuGeometryType TarvexVisuMesh::GetGeometryType() const {
    Mesh const* const mesh = m_context.Read(m_record, "TarvexVisuMesh::GetGeometryType");
    return mesh == nullptr ? TarvexVisuGeometry_Unknown : mesh->geometryType;
}

TarvexVisuFaceIter TarvexVisuMesh::GetFaceIterator() const {
    Mesh const* const mesh = m_context.Read(m_record, "TarvexVisuMesh::GetFaceIterator");
    if (mesh == nullptr) {
        return TarvexVisuFaceIter();
    }
    return TarvexVisuFaceIter(m_context, {m_record, &mesh->faces});
}

TarvexVisuEdgeIter TarvexVisuMesh::GetEdgeIterator() const {
    Mesh const* const mesh = m_context.Read(m_record, "TarvexVisuMesh::GetEdgeIterator");
    if (mesh == nullptr) {
        return TarvexVisuEdgeIter();
    }
    return TarvexVisuEdgeIter(m_context, {m_record, &mesh->edges});
}

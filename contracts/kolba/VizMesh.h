#pragma once

#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/platform/WString.h>

#include <map>
#include <string>
#include <vector>

namespace KolbaVizCore {

/// A tessellated body: its faces, then its edges. Owns both.
class VizMesh : public VizElement {
public:
    VizMesh() = default;
    VizMesh(VizMesh const&) = delete;
    VizMesh& operator=(VizMesh const&) = delete;

    static std::string TypeID() { return "VizMesh"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetMechanicalID(VizPort::WString const& id) { m_mechanicalId = id; }
    VizPort::WString GetMechanicalID() const { return m_mechanicalId; }

    void SetFaceCountHint(unsigned int count) { m_faces.Reserve(count); }
    /// Takes over `face`; null is ignored.
    void AddFace(VizFace* face) { m_faces.Add(face); }
    std::vector<VizFace*> const& GetFaces() const { return m_faces.Get(); }

    void SetEdgeCountHint(unsigned int count) { m_edges.Reserve(count); }
    /// Takes over `edge`; null is ignored.
    void AddEdge(VizEdge* edge) { m_edges.Add(edge); }
    std::vector<VizEdge*> const& GetEdges() const { return m_edges.Get(); }

    /// Enters the mesh, then its faces, then its edges, each under its visual id, so that
    /// what PMI links to by visual id can be found. An element without a visual id cannot be
    /// linked to and is left out. An entry already under an id is replaced. The map points
    /// into the mesh and must not be read after the mesh is gone.
    void FillVisuIdMap(std::map<VizPort::WString, VizElement*>& map);

private:
    VizPort::WString m_mechanicalId;
    OwnedPointers<VizFace> m_faces;
    OwnedPointers<VizEdge> m_edges;
};

} // namespace KolbaVizCore

#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include <utility>
#include <vector>

namespace VizReferenceModeler {

using KolbaVizCore::RenderId;
using KolbaVizCore::SceneBuilder;

ReferenceBrepRenderer::ReferenceBrepRenderer(ReferencePartContainer const& container,
                                             SceneBuilder& builder, RenderId current)
    : BrepPartRenderer(builder, std::move(current)), m_container(&container) {}

ReferenceBrepRenderer::~ReferenceBrepRenderer() = default;

void ReferenceBrepRenderer::drawFaces(SceneBuilder& builder) const {
    TarvexConvertedPart const* const part = m_container->GetConvertedPart().get();
    if (part == nullptr || part->faces.empty())
        return;
    KolbaVizCore::EntityTypeContext const faces(&builder, KolbaVizCore::Face, u"Faces");
    if (!faces.IsOK())
        return;
    KolbaVizCore::AGeometryItemFactory* const factory = getGeometryItemFactory();
    for (TarvexConvertedPart::Face const& face : part->faces) {
        KolbaVizCore::EntityContext const entity(&builder, face.entityId,
                                                 numbered("Face", face.entityId), false, {});
        if (!entity.IsOK() || factory == nullptr)
            continue;
        // The part is a triangle soup with one normal a triangle; the item wants one a
        // corner, and every corner is a point of its own.
        std::size_t const corners = face.positions.size() / 3;
        std::vector<float> normals;
        if (face.normals.size() * 3 == face.positions.size()) {
            normals.reserve(face.positions.size());
            for (std::size_t triangle = 0; triangle < face.normals.size() / 3; ++triangle) {
                for (int corner = 0; corner < 3; ++corner)
                    normals.insert(normals.end(), face.normals.begin() + 3 * triangle,
                                   face.normals.begin() + 3 * triangle + 3);
            }
        }
        std::vector<int> indices(corners);
        for (std::size_t corner = 0; corner < corners; ++corner)
            indices[corner] = static_cast<int>(corner);
        // A face without triangles is refused by the factory and keeps an empty node.
        builder.AddGeometryItem(factory->MakePolygon(
            face.entityId, face.positions.data(), normals.empty() ? nullptr : normals.data(),
            indices.data(), static_cast<unsigned int>(face.positions.size()),
            static_cast<unsigned int>(normals.size()), static_cast<unsigned int>(indices.size()),
            KolbaVizCore::Triangles));
    }
}

void ReferenceBrepRenderer::drawEdges(SceneBuilder& builder) const {
    TarvexConvertedPart const* const part = m_container->GetConvertedPart().get();
    if (part == nullptr || part->edges.empty())
        return;
    KolbaVizCore::EntityTypeContext const edges(&builder, KolbaVizCore::Edge, u"Edges");
    if (!edges.IsOK())
        return;
    KolbaVizCore::AGeometryItemFactory* const factory = getGeometryItemFactory();
    for (TarvexConvertedPart::Edge const& edge : part->edges) {
        KolbaVizCore::EntityContext const entity(&builder, edge.entityId,
                                                 numbered("Edge", edge.entityId), false, {});
        if (!entity.IsOK() || factory == nullptr)
            continue;
        // An edge of fewer than two points is refused by the factory and keeps an empty node.
        builder.AddGeometryItem(factory->MakePolyline(
            edge.entityId, edge.points.data(), static_cast<unsigned int>(edge.points.size())));
    }
}

std::uint32_t ReferenceBrepRenderer::bodyTag() const {
    return static_cast<std::uint32_t>(m_container->GetRefID());
}

bool ReferenceBrepRenderer::hasEntity(std::uint32_t type, std::uint32_t id) const {
    return (type == KolbaVizCore::Face && m_container->HasFace(id)) ||
           (type == KolbaVizCore::Edge && m_container->HasEdge(id));
}

VizBox ReferenceBrepRenderer::partBox() const {
    return m_container->GetBox();
}

} // namespace VizReferenceModeler

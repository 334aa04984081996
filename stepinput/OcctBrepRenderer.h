#pragma once

#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/RenderId.h>

#include <cstdint>

namespace KolbaVizCore {
class Node;
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizBridgeStep {

class OcctPartContainer;

/// Draws one OcctPartContainer into a SceneBuilder, below the node that is current when
/// Render runs, and converts between the paths it drew and the part's entities.
///
/// The drawing has the shape of the reference modeler's, so that the product renderer reads
/// a picked path of either the same way:
///
///     10011 level "BrepPart"         GetRenderId() names this node: its length is `base`
///       1 level "Brep"               index base
///         10003 type "Bodies"        index base + 1
///           <refId> body "Body<refId>"        index base + 2
///             10002 type "Faces"              index base + 3, only if the part has faces
///               <id> entity "Face<id>"        index base + 4, one triangle list each
///             10001 type "Edges"              index base + 3, only if the part has edges
///               <id> entity "Edge<id>"        index base + 4, one polyline each
///
/// Faces and edges carry the part's numbering (StepPart): face i has the id i, edge i the id
/// StepPart::kEdgeIdBase + i; degenerated edges are left out. The triangles are those that
/// BRepMesh left on the faces when the document was read; a face without any is meshed again
/// on a copy, with the container's deflections, so that the shared document stays as it was
/// read. A face takes the colour the file gives it, else the part's colour, else none, so
/// that the instance's colour and the viewer's defaults apply; edges take none.
///
/// Points at the container and at the builder (through ARenderer), owning neither: the
/// product structure keeps the container alive, the host the builder. Owns nothing else but
/// the path it was created at. A copy shares the drawing.
class OcctBrepRenderer : public KolbaVizCore::ARenderer {
public:
    /// The tag and name of the node that holds the drawing.
    static constexpr std::uint32_t PartTag = 10011;
    /// The tag of the level between the part node and the bodies.
    static constexpr std::uint32_t BrepTag = 1;

    /// `current` is the path of the node to draw below, as the caller saw it when it made
    /// the renderer; empty: whatever node is current at Render.
    OcctBrepRenderer(OcctPartContainer const& container, KolbaVizCore::SceneBuilder& builder,
                     KolbaVizCore::RenderId current);
    /// Leaves the drawing in the scene: the scene is the builder's, and a copy of this
    /// renderer may still answer for it. ClearAll takes it out.
    ~OcctBrepRenderer() override;

    /// Draws the part below the current node. True when the part node was drawn, and when
    /// this renderer's drawing is still in the scene (then nothing is drawn again). False
    /// without a current node, when the current node is not the one the renderer was made
    /// for, when another drawing of a part already stands below it, or when the part node's
    /// context was refused. A refused level below the part node leaves out what it would
    /// have held.
    bool Render() override;
    /// Removes the drawing from the scene, with every reference to it, and forgets its path.
    void ClearAll() override;
    /// The entity that a path through the drawing names (also through a node that references
    /// the part node): a path down to a face or edge node gives (refId, Face/Edge, id), a
    /// path that ends at the body or at the level of faces or edges gives the body
    /// (refId, Body, refId). False, and `entity` untouched, for any other path.
    bool Convert(KolbaVizCore::RenderId const& id, KolbaVizCore::EntityId& entity) override;
    /// The path of the node drawn for a face, an edge or the body of this part, as the
    /// first Convert gives them. False, and `id` untouched, for another entity or one whose
    /// node was not drawn.
    bool Convert(KolbaVizCore::EntityId const& entity, KolbaVizCore::RenderId& id) override;
    /// A path into the drawing highlights itself: a new array of one path, which the caller
    /// releases with delete[]. False for a path that does not lead into the drawing.
    bool ConvertToHighlight(KolbaVizCore::RenderId const& id, KolbaVizCore::RenderId*& ids,
                            int& count) override;
    /// The centre of GetGeometryBox; the origin while nothing is drawn.
    void GetGeometryCenter(float* const center) const override;
    /// Half the diagonal of GetGeometryBox; 0 while nothing is drawn.
    float GetGeometryRadius() const override;
    /// The part's box in its own coordinates, low corner then high corner. While nothing is
    /// drawn, and for a part without a shape, the low corner lies above the high one, which
    /// reads back as an empty box.
    void GetGeometryBox(float* const box) const override;

protected:
    bool preRender() override;
    void postRender() override;

private:
    /// The levels below the part node, which is current.
    void drawBrep(KolbaVizCore::SceneBuilder& builder) const;
    void drawFaces(KolbaVizCore::SceneBuilder& builder) const;
    void drawEdges(KolbaVizCore::SceneBuilder& builder) const;
    /// The part node, while the drawing is in the scene; null otherwise.
    KolbaVizCore::Node const* partNode() const;
    /// Whether `id` leads to a node at or below the part node, directly or through a node
    /// that references it.
    bool leadsIntoDrawing(KolbaVizCore::RenderId const& id) const;
    /// The tag of the body node: the reference id.
    std::uint32_t bodyTag() const;
    bool hasEntity(std::uint32_t type, std::uint32_t id) const;

    OcctPartContainer const* m_container; ///< not owned
    KolbaVizCore::RenderId m_current;     ///< where the caller meant the part to go
};

} // namespace VizBridgeStep

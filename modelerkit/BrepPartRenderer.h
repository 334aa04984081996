#pragma once

#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/contracts/platform/WString.h>

#include <cstdint>

namespace KolbaVizCore {
class Node;
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizModelerKit {

/// Draws one BREP part of a modeler into a SceneBuilder, below the node that is current when
/// Render runs, and converts between the paths it drew and the part's entities. A modeler
/// derives from it and draws the faces and edges of its own kind of part; the levels around
/// them are the same for every modeler, so that the product renderer reads a picked path of
/// any of them the same way:
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
/// So the body tag (the reference id) sits at index base + 2 and the face or edge id at
/// index base + 4, where the product renderer looks for the parent id and the id of a picked
/// entity. The part node's tag keeps clear of the product renderer's own "Part" node (10007),
/// which may stand below the same instance node.
///
/// Points at the builder (through ARenderer) without owning it: the host keeps it alive.
/// Owns nothing else but the path it was created at. A copy shares the drawing.
class BrepPartRenderer : public KolbaVizCore::ARenderer {
public:
    /// The tag and name of the node that holds the drawing.
    static constexpr std::uint32_t PartTag = 10011;
    /// The tag of the level between the part node and the bodies.
    static constexpr std::uint32_t BrepTag = 1;

    /// Leaves the drawing in the scene: the scene is the builder's, and a copy of this
    /// renderer may still answer for it. ClearAll takes it out.
    ~BrepPartRenderer() override;

    /// Draws the part below the current node. True when the part node was drawn, also for
    /// a part without faces and edges, and when this renderer's drawing is still in the
    /// scene (then nothing is drawn again). False without a current node, when the current
    /// node is not the one the renderer was made for, when another drawing of a part already
    /// stands below it, or when the part node's context was refused. A refused level below
    /// the part node leaves out what it would have held.
    bool Render() override;
    /// Removes the drawing from the scene, with every reference to it, and forgets its path.
    void ClearAll() override;
    /// The entity that a path through the drawing names (also through a node that references
    /// the part node): a path down to a face or edge node gives (refId, Face/Edge, id), a
    /// path that ends at the body or at the level of faces or edges gives the body
    /// (refId, Body, refId). The ids are read where the product renderer reads them: the
    /// parent at index base + 2, the id at index base + 4 if the path reaches it, else at
    /// base + 2. False, and `entity` untouched, for any other path.
    bool Convert(KolbaVizCore::RenderId const& id, KolbaVizCore::EntityId& entity) override;
    /// The node drawn for a face, an edge or the body of this part (the entities the first
    /// Convert gives), as a path from the product's child that the drawing stands below: the
    /// path without the scene top and the product node (leading word 1). A part is drawn once
    /// and shown under every instance of it, so the caller places the path: a PMI renderer
    /// below the root instance that was picked, the product renderer below the drawing
    /// (skipping the levels the path repeats), a host with InScene. A drawing that hangs
    /// right below the scene top keeps its own tag in front. False, and `id` untouched, for
    /// another entity or one whose node was not drawn.
    bool Convert(KolbaVizCore::EntityId const& entity, KolbaVizCore::RenderId& id) override;
    /// The scene path of a path that the second Convert gave, as drawn. Empty while nothing
    /// is drawn.
    KolbaVizCore::RenderId InScene(KolbaVizCore::RenderId const& relative) const;
    /// A path into the drawing highlights itself: a new array of one path, which the caller
    /// releases with delete[]. False for a path that does not lead into the drawing.
    bool ConvertToHighlight(KolbaVizCore::RenderId const& id, KolbaVizCore::RenderId*& ids,
                            int& count) override;
    /// The centre of GetGeometryBox; the origin while nothing is drawn.
    void GetGeometryCenter(float* const center) const override;
    /// Half the diagonal of GetGeometryBox; 0 while nothing is drawn.
    float GetGeometryRadius() const override;
    /// The part's box in its own coordinates, low corner then high corner. While nothing is
    /// drawn, and for a part with an empty box, the low corner lies above the high one (at
    /// +infinity and -infinity), which reads back as an empty box.
    void GetGeometryBox(float* const box) const override;

protected:
    /// `current` is the path of the node to draw below, as the caller saw it when it made
    /// the renderer; empty: whatever node is current at Render.
    BrepPartRenderer(KolbaVizCore::SceneBuilder& builder, KolbaVizCore::RenderId current);

    bool preRender() override;
    void postRender() override;

    /// The name of an entity's node: `word` followed by `number`, as in "Face12".
    static VizPort::WString numbered(char const* word, std::uint32_t number);

private:
    /// The tag of the body node: the part's reference id.
    virtual std::uint32_t bodyTag() const = 0;
    /// Whether the part has the face (`type` Face) or the edge (`type` Edge) `id`; false for
    /// any other type. Only these entities have paths.
    virtual bool hasEntity(std::uint32_t type, std::uint32_t id) const = 0;
    /// The level of faces, then that of edges, below the body node, which is current. Each
    /// is left out for a part without faces or edges.
    virtual void drawFaces(KolbaVizCore::SceneBuilder& builder) const = 0;
    virtual void drawEdges(KolbaVizCore::SceneBuilder& builder) const = 0;
    /// The part's box in its own coordinates; empty for a part without geometry.
    virtual KolbaVizCore::VizBox partBox() const = 0;

    /// The levels below the part node, which is current.
    void drawBrep(KolbaVizCore::SceneBuilder& builder) const;
    /// The part node, while the drawing is in the scene; null otherwise.
    KolbaVizCore::Node const* partNode() const;
    /// How many tags of the drawing's path the second Convert leaves out.
    int omittedHead() const;
    /// Whether `id` leads to a node at or below the part node, directly or through a node
    /// that references it.
    bool leadsIntoDrawing(KolbaVizCore::RenderId const& id) const;

    KolbaVizCore::RenderId m_current; ///< where the caller meant the part to go
};

} // namespace VizModelerKit

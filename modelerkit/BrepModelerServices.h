#pragma once

#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/services/VizModelerServices.h>

#include <memory>

namespace VizModelerKit {

class BrepPartRenderer;

/// The part of a modeler's services that every modeler drawing its parts with a
/// BrepPartRenderer shares: reading the paths of such a drawing, making the renderer, finding
/// the face or edge an import-library entity names, and exploding boxes. A modeler derives
/// from it, imports its own kind of part container and says which faces and edges a part has.
///
/// Owns nothing; a derived modeler says what it owns.
class BrepModelerServices : public VizBridgeTarvex::VizModelerServices {
public:
    ~BrepModelerServices() override;

    /// Reads a path the way BrepPartRenderer draws it: `entity` comes filled with the tag of
    /// the body node as its parent id, which is the reference id of the part the path runs
    /// through. So a container answers only for paths through its own part, even where
    /// another part has a face or edge of the same id. `id` then names
    ///   - a face or edge of the part: (refId, Face / Edge, id), faces looked up first, so an
    ///     id that names both gives the face (the renderer's Convert tells them apart by the
    ///     path);
    ///   - else the reference id itself, for a path that ends at the body: (refId, Body,
    ///     refId).
    /// These are the entities BrepPartRenderer::Convert gives for the same paths. False, and
    /// `entity` untouched, otherwise.
    bool ConvertToEntity(unsigned long const& id, VizBridgeTarvex::VizPartContainer* container,
                         VizBridgeTarvex::EntityId& entity) override;
    bool Reserved4() override;
    /// A new renderer of the modeler's own for one of its containers, which the interface
    /// hands to the caller to delete. It points at `container` and `builder` without owning
    /// them, and draws below the node `current` names (null: the node current at its
    /// Render). Null for a null container, another modeler's container, or a null builder.
    KolbaVizCore::ARenderer* CreateRenderer(VizBridgeTarvex::VizPartContainer* container,
                                            KolbaVizCore::SceneBuilder* builder,
                                            VizBridgeTarvex::RenderId* current) override;
    /// `box` moved by `transformation` (the box around its moved corners), then shifted by
    /// its centre times the factors, axis by axis: factors 0 leave the moved box in place,
    /// 1 doubles its distance from the origin. An empty box stays empty.
    VizBridgeTarvex::VizBox ExplodeBox(VizBridgeTarvex::VizTransf const& transformation,
                                       VizBridgeTarvex::VizBox const& box, double const& x,
                                       double const& y, double const& z) override;
    bool GetAnnotationEntityId(VizBridgeTarvex::VizPartContainer* container,
                               TarvexPMIAnnotation& annotation, int* index,
                               VizBridgeTarvex::EntityId& entity) override;
    /// Follows `entity` down its instances to the face or edge it names in `container`.
    bool GetEntityId(VizBridgeTarvex::VizPartContainer* container, TarvexEntity& entity,
                     VizBridgeTarvex::EntityId& id) override;
    bool Reserved11() override;
    bool Reserved12() override;
    bool Reserved13() override;

protected:
    BrepModelerServices() = default;
    BrepModelerServices(BrepModelerServices const&) = default;
    BrepModelerServices& operator=(BrepModelerServices const&) = default;

private:
    /// Whether `container` is one that this modeler imported: the other hooks are asked
    /// about such containers only.
    virtual bool ownsPart(VizBridgeTarvex::VizPartContainer const& container) const = 0;
    /// Whether the part has the face (`type` Face) or the edge (`type` Edge) `id`.
    virtual bool hasEntity(VizBridgeTarvex::VizPartContainer const& part,
                           KolbaVizCore::EntityType type, unsigned long id) const = 0;
    /// A new renderer of the part, drawing below the node `current` names (empty: the node
    /// current at its Render).
    virtual std::unique_ptr<BrepPartRenderer>
    newRenderer(VizBridgeTarvex::VizPartContainer const& part, KolbaVizCore::SceneBuilder& builder,
                VizBridgeTarvex::RenderId current) const = 0;

    /// The face or edge `id` of `container` as an entity of its reference. False when the
    /// container is not one of this modeler's or has no such face or edge.
    bool findEntity(unsigned long id, VizBridgeTarvex::VizPartContainer* container,
                    VizBridgeTarvex::EntityId& entity) const;
};

} // namespace VizModelerKit

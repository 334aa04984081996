#pragma once

#include <VizBridge/services/VizModelerServices.h>
#include <VizBridge/stepinput/StepReadOptions.h>

#include <memory>

namespace VizBridgeStep {

class StepDocument;

/// The modeler for the BREP of STEP files: it imports a part as the Open CASCADE shape that
/// a StepDocument read (an OcctPartContainer), draws it with an OcctBrepRenderer, names faces
/// and edges by the part's numbering (StepPart), the same ids that the tessellated road
/// gives them, and explodes boxes.
///
/// Shares the document with its clones and containers, so that it outlives all of them;
/// owns nothing else but the deflections.
class OcctModelerServices : public VizBridgeTarvex::VizModelerServices {
public:
    /// `document` is shared with every clone and container; with a null one every ImportPart
    /// fails. `options` are the ones the document was read with: a face that the reading left
    /// without triangles is meshed again with their deflections.
    explicit OcctModelerServices(std::shared_ptr<StepDocument const> document,
                                 StepReadOptions const& options = {});

    /// "Open CASCADE".
    VizBridgeTarvex::WString GetName() override;
    /// Reads a path the way OcctBrepRenderer draws it: `entity` comes filled with the tag of
    /// the body node as its parent id, which is the reference id of the part the path runs
    /// through, so that a container answers only for paths through its own part. `id` then
    /// names a face, else an edge of the part: (refId, Face / Edge, id); else the reference
    /// id itself, for a path that ends at the body: (refId, Body, refId). These are the
    /// entities OcctBrepRenderer::Convert gives for the same paths. False, and `entity`
    /// untouched, otherwise.
    bool ConvertToEntity(unsigned long const& id, VizBridgeTarvex::VizPartContainer* container,
                         VizBridgeTarvex::EntityId& entity) override;
    bool Reserved4() override;
    /// A new OcctBrepRenderer for an OcctPartContainer, which the interface hands to the
    /// caller to delete. It points at `container` and `builder` without owning them, and
    /// draws below the node `current` names (null: the node current at its Render). Null
    /// for a null container, another modeler's container, or a null builder.
    KolbaVizCore::ARenderer* CreateRenderer(VizBridgeTarvex::VizPartContainer* container,
                                            KolbaVizCore::SceneBuilder* builder,
                                            VizBridgeTarvex::RenderId* current) override;
    /// A copy on the same document; the caller owns it.
    VizModelerServices* Clone() override;
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
    /// Hands out a new OcctPartContainer on the document's part of reference `id`, and the
    /// part document's PMI in `result`. `policy` is not read: the shape was read with the
    /// document. Fails with a text that names the reference when the document has no such
    /// part.
    bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                    VizBridgeTarvex::VizPartContainer*& container, TarvexPolicy* policy,
                    VizBridgeTarvex::WString& error) override;
    bool Reserved11() override;
    bool Reserved12() override;
    bool Reserved13() override;

private:
    /// The face or edge `id` of `container` as an entity of its reference. False when the
    /// container is not one of this modeler's or has no such face or edge.
    static bool findEntity(unsigned long id, VizBridgeTarvex::VizPartContainer* container,
                           VizBridgeTarvex::EntityId& entity);

    std::shared_ptr<StepDocument const> m_document;
    StepReadOptions m_options;
};

} // namespace VizBridgeStep

#pragma once

#include <VizBridge/model/VizTypes.h>

class TarvexEntity;
class TarvexPartDocument;
class TarvexPartImportResult;
class TarvexPMIAnnotation;
class TarvexPolicy;

namespace KolbaVizCore {
class ARenderer;
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {

class VizPartContainer;

/// The plug-in through which a host gives the system a modeler for BREP parts: the modeler
/// imports part documents into containers of its own, draws them, and translates between its
/// entities and the system's ids.
///
/// A host passes one object to VizBuilder::SetModelerServices and to the renderer it makes;
/// it keeps ownership and must keep the object alive while either uses it. A renderer works
/// on its own Clone, which it deletes.
///
/// Every operation is called on the thread that called into the system.
class VizModelerServices {
public:
    VizModelerServices() = default;
    VizModelerServices(VizModelerServices const&) = default;
    VizModelerServices& operator=(VizModelerServices const&) = default;
    virtual ~VizModelerServices() = default;

    /// The modeler's name, quoted in progress texts. May be empty.
    virtual WString GetName() = 0;

    /// Finds the entity of `container` that a picked path names: `id` is the first field of
    /// `entity`; on true `entity` holds the answer. False: the entity is not in this part.
    virtual bool ConvertToEntity(unsigned long const& id, VizPartContainer* container,
                                 EntityId& entity) = 0;

    /// Reserved for the modeler's own use; the system never calls it.
    virtual bool Reserved4() = 0;

    /// A new renderer (owned by the caller) that draws `container` below the node `current`
    /// of `builder`, or null.
    virtual KolbaVizCore::ARenderer* CreateRenderer(VizPartContainer* container,
                                                    KolbaVizCore::SceneBuilder* builder,
                                                    RenderId* current) = 0;

    /// A new copy of these services, owned by the caller. Should not be null.
    virtual VizModelerServices* Clone() = 0;

    /// `box` of a part moved by the instance's `transformation` and pushed away from the
    /// product's origin by the explode factors.
    virtual VizBox ExplodeBox(VizTransf const& transformation, VizBox const& box, double const& x,
                              double const& y, double const& z) = 0;

    /// The entity that element `*index` (from 0) of `annotation` is linked to, in
    /// `container`. True when `entity` was filled.
    virtual bool GetAnnotationEntityId(VizPartContainer* container, TarvexPMIAnnotation& annotation,
                                       int* index, EntityId& entity) = 0;

    /// The id of an import-library entity of `container`. True when `id` was filled.
    virtual bool GetEntityId(VizPartContainer* container, TarvexEntity& entity, EntityId& id) = 0;

    /// Imports the part document of reference `id`. Called with `container` null and `error`
    /// empty; `policy` may be null.
    ///
    /// True with a new `container`: the container passes to the product structure, and
    /// `result` answers GetPMIData. False, or true with `container` left null, is a failure
    /// whose reason may be put in `error`. A container that the modeler made and still
    /// left in `container` when it answers false stays the modeler's: the system neither
    /// stores nor deletes it, and the same holds after a throw. May throw; the system
    /// records the failure and goes on with the next part.
    virtual bool ImportPart(int const& id, TarvexPartDocument& document,
                            TarvexPartImportResult& result, VizPartContainer*& container,
                            TarvexPolicy* policy, WString& error) = 0;

    /// Reserved for the modeler's own use; the system never calls them.
    virtual bool Reserved11() = 0;
    virtual bool Reserved12() = 0;
    virtual bool Reserved13() = 0;
};

} // namespace VizBridgeTarvex

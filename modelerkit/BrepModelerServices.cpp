#include <VizBridge/modelerkit/BrepModelerServices.h>

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/model/BoxTransform.h>
#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/modelerkit/BrepPartRenderer.h>

#include <cstdint>

namespace VizModelerKit {

using VizBridgeTarvex::EntityId;
using VizBridgeTarvex::RenderId;
using VizBridgeTarvex::VizBox;
using VizBridgeTarvex::VizPartContainer;
using VizBridgeTarvex::VizTransf;

BrepModelerServices::~BrepModelerServices() = default;

bool BrepModelerServices::ConvertToEntity(unsigned long const& id, VizPartContainer* container,
                                          EntityId& entity) {
    if (container == nullptr || !ownsPart(*container))
        return false;
    auto const body = static_cast<std::uint32_t>(container->GetRefID());
    // The caller walks every part with the same path until one answers: without this, a
    // part with a face of the picked id would answer for a pick on another part, and parts
    // that number their faces from 1 each have such a face.
    if (entity.GetParentId() != body)
        return false;
    if (findEntity(id, container, entity))
        return true;
    if (id != body)
        return false;
    entity = EntityId(body, KolbaVizCore::Body, body);
    return true;
}

bool BrepModelerServices::Reserved4() {
    return false;
}

KolbaVizCore::ARenderer* BrepModelerServices::CreateRenderer(VizPartContainer* container,
                                                             KolbaVizCore::SceneBuilder* builder,
                                                             RenderId* current) {
    if (container == nullptr || !ownsPart(*container) || builder == nullptr)
        return nullptr;
    // The interface hands the renderer to the caller, who deletes it.
    return newRenderer(*container, *builder, current != nullptr ? *current : RenderId()).release();
}

VizBox BrepModelerServices::ExplodeBox(VizTransf const& transformation, VizBox const& box,
                                       double const& x, double const& y, double const& z) {
    if (box.IsEmpty())
        return box;
    VizBox const moved = VizBridgeTarvex::TransformBox(transformation, box);
    double center[3];
    moved.GetCenter(center);
    double const factors[3] = {x, y, z};
    double exploded[2][3];
    for (int axis = 0; axis < 3; ++axis) {
        double const shift = center[axis] * factors[axis];
        exploded[0][axis] = moved.GetLow()[axis] + shift;
        exploded[1][axis] = moved.GetHigh()[axis] + shift;
    }
    return VizBox(exploded[0], exploded[1]);
}

bool BrepModelerServices::GetAnnotationEntityId(VizPartContainer* container,
                                                TarvexPMIAnnotation& annotation, int* index,
                                                EntityId& entity) {
    // Out of range, GetLinkedElement leaves its argument as a default entity, whose id 0
    // could still name a face: such an index must not reach the lookup.
    if (index == nullptr || *index < 0 || *index >= annotation.GetLinkedElementsCount())
        return false;
    TarvexEntity linked;
    annotation.GetLinkedElement(*index, linked);
    return GetEntityId(container, linked, entity);
}

bool BrepModelerServices::GetEntityId(VizPartContainer* container, TarvexEntity& entity,
                                      EntityId& id) {
    // Each step leaves one instance; the entity below the last one names the face or edge.
    TarvexEntity leaf = entity;
    TarvexInstanceEntity below;
    while (leaf.GetInstanceEntity(below))
        leaf = below.GetEntity();
    return findEntity(leaf.GetEntityId(), container, id);
}

bool BrepModelerServices::Reserved11() {
    return false;
}

bool BrepModelerServices::Reserved12() {
    return false;
}

bool BrepModelerServices::Reserved13() {
    return false;
}

bool BrepModelerServices::findEntity(unsigned long id, VizPartContainer* container,
                                     EntityId& entity) const {
    if (container == nullptr || !ownsPart(*container))
        return false;
    KolbaVizCore::EntityType type;
    if (hasEntity(*container, KolbaVizCore::Face, id))
        type = KolbaVizCore::Face;
    else if (hasEntity(*container, KolbaVizCore::Edge, id))
        type = KolbaVizCore::Edge;
    else
        return false;
    entity = EntityId(static_cast<std::uint32_t>(container->GetRefID()), type,
                      static_cast<std::uint32_t>(id));
    return true;
}

} // namespace VizModelerKit

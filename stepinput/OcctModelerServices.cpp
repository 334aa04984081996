#include <VizBridge/stepinput/OcctModelerServices.h>

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/model/BoxTransform.h>
#include <VizBridge/stepinput/OcctBrepRenderer.h>
#include <VizBridge/stepinput/OcctPartContainer.h>
#include <VizBridge/stepinput/StepDocument.h>

#include <cstdint>
#include <string>
#include <utility>

namespace VizBridgeStep {

using VizBridgeTarvex::EntityId;
using VizBridgeTarvex::RenderId;
using VizBridgeTarvex::VizBox;
using VizBridgeTarvex::VizPartContainer;
using VizBridgeTarvex::VizTransf;
using VizBridgeTarvex::WString;

OcctModelerServices::OcctModelerServices(std::shared_ptr<StepDocument const> document,
                                         StepReadOptions const& options)
    : m_document(std::move(document)), m_options(options) {}

WString OcctModelerServices::GetName() {
    return u"Open CASCADE";
}

bool OcctModelerServices::ConvertToEntity(unsigned long const& id, VizPartContainer* container,
                                          EntityId& entity) {
    auto const* const part = dynamic_cast<OcctPartContainer const*>(container);
    if (part == nullptr)
        return false;
    auto const body = static_cast<std::uint32_t>(part->GetRefID());
    // The caller walks every part with the same path until one answers: without this, a
    // part with a face of the picked id would answer for a pick on another part, and every
    // part of a STEP file has a face 1.
    if (entity.GetParentId() != body)
        return false;
    if (findEntity(id, container, entity))
        return true;
    if (id != body)
        return false;
    entity = EntityId(body, KolbaVizCore::Body, body);
    return true;
}

bool OcctModelerServices::Reserved4() {
    return false;
}

KolbaVizCore::ARenderer* OcctModelerServices::CreateRenderer(VizPartContainer* container,
                                                             KolbaVizCore::SceneBuilder* builder,
                                                             RenderId* current) {
    auto const* const part = dynamic_cast<OcctPartContainer const*>(container);
    if (part == nullptr || builder == nullptr)
        return nullptr;
    // The interface hands the renderer to the caller, who deletes it.
    return new OcctBrepRenderer(*part, *builder, current != nullptr ? *current : RenderId());
}

VizBridgeTarvex::VizModelerServices* OcctModelerServices::Clone() {
    // The interface hands the copy to the caller, who deletes it.
    return new OcctModelerServices(*this);
}

VizBox OcctModelerServices::ExplodeBox(VizTransf const& transformation, VizBox const& box,
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

bool OcctModelerServices::GetAnnotationEntityId(VizPartContainer* container,
                                                TarvexPMIAnnotation& annotation, int* index,
                                                EntityId& entity) {
    // Out of range, GetLinkedElement leaves its argument as a default entity, whose id 0
    // must not reach the lookup.
    if (index == nullptr || *index < 0 || *index >= annotation.GetLinkedElementsCount())
        return false;
    TarvexEntity linked;
    annotation.GetLinkedElement(*index, linked);
    return GetEntityId(container, linked, entity);
}

bool OcctModelerServices::GetEntityId(VizPartContainer* container, TarvexEntity& entity,
                                      EntityId& id) {
    // Each step leaves one instance; the entity below the last one names the face or edge.
    TarvexEntity leaf = entity;
    TarvexInstanceEntity below;
    while (leaf.GetInstanceEntity(below))
        leaf = below.GetEntity();
    return findEntity(leaf.GetEntityId(), container, id);
}

bool OcctModelerServices::ImportPart(int const& id, TarvexPartDocument& document,
                                     TarvexPartImportResult& result, VizPartContainer*& container,
                                     TarvexPolicy*, WString& error) {
    StepPart const* const part =
        id > 0 && m_document ? m_document->FindPart(static_cast<unsigned int>(id)) : nullptr;
    if (part == nullptr) {
        error = VizPort::Widen("the STEP document has no part of reference " + std::to_string(id));
        return false;
    }
    // The model names the reference as the file does; a document that names none leaves the
    // part's own name.
    WString name = document.GetName().ToWString();
    if (name.empty())
        name = VizPort::Widen(part->name);
    // Held until handed over, so that a throwing GetPMIData leaks nothing.
    auto made = std::make_unique<OcctPartContainer>(name, id, m_document, *part, m_options);
    result.SetPMIData(document.GetPMIData());
    // The interface hands the container to the caller, who owns it from here on.
    container = made.release();
    return true;
}

bool OcctModelerServices::Reserved11() {
    return false;
}

bool OcctModelerServices::Reserved12() {
    return false;
}

bool OcctModelerServices::Reserved13() {
    return false;
}

bool OcctModelerServices::findEntity(unsigned long id, VizPartContainer* container,
                                     EntityId& entity) {
    auto const* const part = dynamic_cast<OcctPartContainer const*>(container);
    if (part == nullptr)
        return false;
    KolbaVizCore::EntityType type;
    if (part->HasFace(id))
        type = KolbaVizCore::Face;
    else if (part->HasEdge(id))
        type = KolbaVizCore::Edge;
    else
        return false;
    entity = EntityId(static_cast<std::uint32_t>(part->GetRefID()), type,
                      static_cast<std::uint32_t>(id));
    return true;
}

} // namespace VizBridgeStep

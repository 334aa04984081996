#include <VizBridge/referencemodeler/ReferenceModelerServices.h>

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/model/BoxTransform.h>
#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include <cstdint>
#include <memory>
#include <stdexcept>
#include <utility>

namespace VizReferenceModeler {

ReferenceModelerServices::ReferenceModelerServices(WString name) : m_name(std::move(name)) {}

ReferenceModelerServices::ReferenceModelerServices(ReferenceModelerServices const& other)
    : VizModelerServices(other), m_name(other.m_name), m_failures(other.m_failures),
      m_importCalls(other.GetImportCalls()) {}

ReferenceModelerServices&
ReferenceModelerServices::operator=(ReferenceModelerServices const& other) {
    if (this == &other)
        return *this;
    VizModelerServices::operator=(other);
    m_name = other.m_name;
    m_failures = other.m_failures;
    std::vector<ImportCall> calls = other.GetImportCalls();
    std::lock_guard<std::mutex> const lock(m_callsLock);
    m_importCalls = std::move(calls);
    return *this;
}

ReferenceModelerServices::~ReferenceModelerServices() = default;

void ReferenceModelerServices::PlanFailure(int referenceId, PlannedFailure failure) {
    m_failures[referenceId] = std::move(failure);
}

void ReferenceModelerServices::ClearFailure(int referenceId) {
    m_failures.erase(referenceId);
}

void ReferenceModelerServices::ClearFailures() {
    m_failures.clear();
}

std::vector<ReferenceModelerServices::ImportCall> ReferenceModelerServices::GetImportCalls() const {
    std::lock_guard<std::mutex> const lock(m_callsLock);
    return m_importCalls;
}

WString ReferenceModelerServices::GetName() {
    return m_name;
}

bool ReferenceModelerServices::ConvertToEntity(unsigned long const& id, VizPartContainer* container,
                                               EntityId& entity) {
    auto const* const part = dynamic_cast<ReferencePartContainer const*>(container);
    if (part == nullptr)
        return false;
    std::uint32_t const body = static_cast<std::uint32_t>(part->GetRefID());
    // The caller walks every part with the same path until one answers: without this, a
    // part with a face of the picked id would answer for a pick on another part.
    if (entity.GetParentId() != body)
        return false;
    if (findEntity(id, container, entity))
        return true;
    if (id != body)
        return false;
    entity = EntityId(body, KolbaVizCore::Body, body);
    return true;
}

bool ReferenceModelerServices::Reserved4() {
    return false;
}

KolbaVizCore::ARenderer*
ReferenceModelerServices::CreateRenderer(VizPartContainer* container,
                                         KolbaVizCore::SceneBuilder* builder, RenderId* current) {
    auto const* const part = dynamic_cast<ReferencePartContainer const*>(container);
    if (part == nullptr || builder == nullptr)
        return nullptr;
    // The interface hands the renderer to the caller, who deletes it.
    return new ReferenceBrepRenderer(*part, *builder, current != nullptr ? *current : RenderId());
}

VizBridgeTarvex::VizModelerServices* ReferenceModelerServices::Clone() {
    // The interface hands the copy to the caller, who deletes it.
    return new ReferenceModelerServices(*this);
}

VizBox ReferenceModelerServices::ExplodeBox(VizTransf const& transformation, VizBox const& box,
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

bool ReferenceModelerServices::GetAnnotationEntityId(VizPartContainer* container,
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

bool ReferenceModelerServices::GetEntityId(VizPartContainer* container, TarvexEntity& entity,
                                           EntityId& id) {
    // Each step leaves one instance; the entity below the last one names the face or edge.
    TarvexEntity leaf = entity;
    TarvexInstanceEntity below;
    while (leaf.GetInstanceEntity(below))
        leaf = below.GetEntity();
    return findEntity(leaf.GetEntityId(), container, id);
}

bool ReferenceModelerServices::ImportPart(int const& id, TarvexPartDocument& document,
                                          TarvexPartImportResult& result,
                                          VizPartContainer*& container, TarvexPolicy*,
                                          WString& error) {
    {
        std::lock_guard<std::mutex> const lock(m_callsLock);
        m_importCalls.push_back(ImportCall{id, std::this_thread::get_id()});
    }

    auto const planned = m_failures.find(id);
    if (planned != m_failures.end()) {
        PlannedFailure const& failure = planned->second;
        switch (failure.kind) {
        case FailureKind::ReturnFalse:
            error = VizPort::Widen(failure.text);
            return false;
        case FailureKind::ReturnNullContainer:
            return true;
        case FailureKind::ThrowStdException:
            throw std::runtime_error(failure.text);
        case FailureKind::ThrowNonStdException:
            throw int{id};
        }
    }

    if (!document.IsValid()) {
        error = u"no part document";
        return false;
    }
    std::shared_ptr<TarvexConvertedPart const> part = document.GetConvertedPart();
    if (!part) {
        error = u"conversion failed";
        return false;
    }
    // Held until handed over, so that a throwing GetPMIData leaks nothing.
    auto made = std::make_unique<ReferencePartContainer>(document.GetName().ToWString(), id,
                                                         std::move(part));
    result.SetPMIData(document.GetPMIData());
    // The interface hands the container to the caller, who owns it from here on.
    container = made.release();
    return true;
}

bool ReferenceModelerServices::Reserved11() {
    return false;
}

bool ReferenceModelerServices::Reserved12() {
    return false;
}

bool ReferenceModelerServices::Reserved13() {
    return false;
}

bool ReferenceModelerServices::findEntity(unsigned long id, VizPartContainer* container,
                                          EntityId& entity) {
    auto const* const part = dynamic_cast<ReferencePartContainer const*>(container);
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

} // namespace VizReferenceModeler

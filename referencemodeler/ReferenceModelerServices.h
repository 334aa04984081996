#pragma once

#include <VizBridge/services/VizModelerServices.h>

#include <map>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace VizReferenceModeler {

using VizBridgeTarvex::EntityId;
using VizBridgeTarvex::RenderId;
using VizBridgeTarvex::VizBox;
using VizBridgeTarvex::VizPartContainer;
using VizBridgeTarvex::VizTransf;
using VizBridgeTarvex::WString;

class ReferencePartContainer;

/// A working modeler for hosts, demos and tests: it imports a part as the document's
/// tessellated faces and edges (a ReferencePartContainer), draws it with a
/// ReferenceBrepRenderer, names faces and edges by their authored entity ids, and explodes
/// boxes.
///
/// For tests of the callers it can fail on demand, per reference id, in each of the ways
/// an ImportPart may fail, and it records on which thread each ImportPart ran.
///
/// Owns its name, its failure plan and its call record; a Clone copies all three and then
/// goes its own way.
class ReferenceModelerServices : public VizBridgeTarvex::VizModelerServices {
public:
    /// How ImportPart fails for a planned reference.
    enum class FailureKind {
        ReturnFalse,         ///< false, with the plan's text as the error
        ReturnNullContainer, ///< true, but no container
        ThrowStdException,   ///< throws a std::runtime_error whose what() is the plan's text
        ThrowNonStdException ///< throws the reference id as an int
    };
    struct PlannedFailure {
        FailureKind kind = FailureKind::ReturnFalse;
        std::string text; ///< error or what() text; unused by the other kinds
    };
    /// One ImportPart call, in the order they came.
    struct ImportCall {
        int referenceId = 0;
        std::thread::id thread;
    };

    explicit ReferenceModelerServices(WString name = u"Reference Modeler");
    ReferenceModelerServices(ReferenceModelerServices const& other);
    ReferenceModelerServices& operator=(ReferenceModelerServices const& other);
    ~ReferenceModelerServices() override;

    /// Every later ImportPart of `referenceId` fails as `failure` says, until cleared.
    void PlanFailure(int referenceId, PlannedFailure failure);
    void ClearFailure(int referenceId);
    void ClearFailures();

    /// The ImportPart calls so far.
    std::vector<ImportCall> GetImportCalls() const;

    WString GetName() override;
    /// Reads a path the way ReferenceBrepRenderer draws it: `entity` comes filled with the
    /// tag of the body node as its parent id, which is the reference id of the part the path
    /// runs through. So a container answers only for paths through its own part, even where
    /// another part has a face or edge of the same id. `id` then names
    ///   - a face or edge of the part: (refId, Face / Edge, id), faces looked up first, so an
    ///     id that names both gives the face (the renderer's Convert tells them apart by the
    ///     path);
    ///   - else the reference id itself, for a path that ends at the body: (refId, Body,
    ///     refId).
    /// These are the entities ReferenceBrepRenderer::Convert gives for the same paths. False,
    /// and `entity` untouched, otherwise.
    bool ConvertToEntity(unsigned long const& id, VizPartContainer* container,
                         EntityId& entity) override;
    bool Reserved4() override;
    /// A new ReferenceBrepRenderer for a ReferencePartContainer, which the interface hands
    /// to the caller to delete. It points at `container` and `builder` without owning them,
    /// and draws below the node `current` names (null: the node current at its Render).
    /// Null for a null container, another modeler's container, or a null builder.
    KolbaVizCore::ARenderer* CreateRenderer(VizPartContainer* container,
                                            KolbaVizCore::SceneBuilder* builder,
                                            RenderId* current) override;
    /// A copy with this object's name, plan and call record; the caller owns it.
    VizModelerServices* Clone() override;
    /// `box` moved by `transformation` (the box around its moved corners), then shifted by
    /// its centre times the factors, axis by axis: factors 0 leave the moved box in place,
    /// 1 doubles its distance from the origin. An empty box stays empty.
    VizBox ExplodeBox(VizTransf const& transformation, VizBox const& box, double const& x,
                      double const& y, double const& z) override;
    bool GetAnnotationEntityId(VizPartContainer* container, TarvexPMIAnnotation& annotation,
                               int* index, EntityId& entity) override;
    /// Follows `entity` down its instances to the face or edge it names in `container`.
    bool GetEntityId(VizPartContainer* container, TarvexEntity& entity, EntityId& id) override;
    /// Converts the document and hands out a new ReferencePartContainer. `policy` is not
    /// read: the conversion has no options. Fails with "conversion failed" when the
    /// document gives no converted part, and as planned for a planned reference.
    bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                    VizPartContainer*& container, TarvexPolicy* policy, WString& error) override;
    bool Reserved11() override;
    bool Reserved12() override;
    bool Reserved13() override;

private:
    /// The face or edge `id` of `container` as an entity of its reference. False when the
    /// container is not one of this modeler's or has no such face or edge.
    static bool findEntity(unsigned long id, VizPartContainer* container, EntityId& entity);

    WString m_name;
    std::map<int, PlannedFailure> m_failures;
    /// Guards m_importCalls only, so that a caller on a wrong thread shows up in the record
    /// instead of corrupting it.
    mutable std::mutex m_callsLock;
    std::vector<ImportCall> m_importCalls;
};

} // namespace VizReferenceModeler

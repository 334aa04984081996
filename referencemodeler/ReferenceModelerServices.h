#pragma once

#include <VizBridge/modelerkit/BrepModelerServices.h>

#include <map>
#include <memory>
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
/// ReferenceBrepRenderer, and names faces and edges by their authored entity ids; the rest
/// of the modeler is the BrepModelerServices it derives from.
///
/// For tests of the callers it can fail on demand, per reference id, in each of the ways
/// an ImportPart may fail, and it records on which thread each ImportPart ran.
///
/// Owns its name, its failure plan and its call record; a Clone copies all three and then
/// goes its own way.
class ReferenceModelerServices : public VizModelerKit::BrepModelerServices {
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
    /// A copy with this object's name, plan and call record; the caller owns it.
    VizModelerServices* Clone() override;
    /// Converts the document and hands out a new ReferencePartContainer. `policy` is not
    /// read: the conversion has no options. Fails with "conversion failed" when the
    /// document gives no converted part, and as planned for a planned reference.
    bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                    VizPartContainer*& container, TarvexPolicy* policy, WString& error) override;

private:
    /// Whether `container` is a ReferencePartContainer.
    bool ownsPart(VizPartContainer const& container) const override;
    bool hasEntity(VizPartContainer const& part, KolbaVizCore::EntityType type,
                   unsigned long id) const override;
    /// A ReferenceBrepRenderer.
    std::unique_ptr<VizModelerKit::BrepPartRenderer>
    newRenderer(VizPartContainer const& part, KolbaVizCore::SceneBuilder& builder,
                RenderId current) const override;

    WString m_name;
    std::map<int, PlannedFailure> m_failures;
    /// Guards m_importCalls only, so that a caller on a wrong thread shows up in the record
    /// instead of corrupting it.
    mutable std::mutex m_callsLock;
    std::vector<ImportCall> m_importCalls;
};

} // namespace VizReferenceModeler

#include <VizBridge/referencemodeler/ReferenceModelerServices.h>

#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include <memory>
#include <stdexcept>
#include <utility>

namespace VizReferenceModeler {

ReferenceModelerServices::ReferenceModelerServices(WString name) : m_name(std::move(name)) {}

ReferenceModelerServices::ReferenceModelerServices(ReferenceModelerServices const& other)
    : BrepModelerServices(other), m_name(other.m_name), m_failures(other.m_failures),
      m_importCalls(other.GetImportCalls()) {}

ReferenceModelerServices&
ReferenceModelerServices::operator=(ReferenceModelerServices const& other) {
    if (this == &other)
        return *this;
    BrepModelerServices::operator=(other);
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

VizBridgeTarvex::VizModelerServices* ReferenceModelerServices::Clone() {
    // The interface hands the copy to the caller, who deletes it.
    return new ReferenceModelerServices(*this);
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

bool ReferenceModelerServices::ownsPart(VizPartContainer const& container) const {
    return dynamic_cast<ReferencePartContainer const*>(&container) != nullptr;
}

bool ReferenceModelerServices::hasEntity(VizPartContainer const& part,
                                         KolbaVizCore::EntityType type, unsigned long id) const {
    // Asked only after ownsPart said yes.
    auto const& own = static_cast<ReferencePartContainer const&>(part);
    return (type == KolbaVizCore::Face && own.HasFace(id)) ||
           (type == KolbaVizCore::Edge && own.HasEdge(id));
}

std::unique_ptr<VizModelerKit::BrepPartRenderer>
ReferenceModelerServices::newRenderer(VizPartContainer const& part,
                                      KolbaVizCore::SceneBuilder& builder, RenderId current) const {
    return std::make_unique<ReferenceBrepRenderer>(static_cast<ReferencePartContainer const&>(part),
                                                   builder, std::move(current));
}

} // namespace VizReferenceModeler

#include <VizBridge/stepinput/OcctModelerServices.h>

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/stepinput/OcctBrepRenderer.h>
#include <VizBridge/stepinput/OcctPartContainer.h>
#include <VizBridge/stepinput/StepDocument.h>

#include <memory>
#include <string>
#include <utility>

namespace VizBridgeStep {

using VizBridgeTarvex::RenderId;
using VizBridgeTarvex::VizPartContainer;
using VizBridgeTarvex::WString;

OcctModelerServices::OcctModelerServices(std::shared_ptr<StepDocument const> document,
                                         StepReadOptions const& options)
    : m_document(std::move(document)), m_options(options) {}

WString OcctModelerServices::GetName() {
    return u"Open CASCADE";
}

VizBridgeTarvex::VizModelerServices* OcctModelerServices::Clone() {
    // The interface hands the copy to the caller, who deletes it.
    return new OcctModelerServices(*this);
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

bool OcctModelerServices::ownsPart(VizPartContainer const& container) const {
    return dynamic_cast<OcctPartContainer const*>(&container) != nullptr;
}

bool OcctModelerServices::hasEntity(VizPartContainer const& part, KolbaVizCore::EntityType type,
                                    unsigned long id) const {
    // Asked only after ownsPart said yes.
    auto const& own = static_cast<OcctPartContainer const&>(part);
    return (type == KolbaVizCore::Face && own.HasFace(id)) ||
           (type == KolbaVizCore::Edge && own.HasEdge(id));
}

std::unique_ptr<VizModelerKit::BrepPartRenderer>
OcctModelerServices::newRenderer(VizPartContainer const& part, KolbaVizCore::SceneBuilder& builder,
                                 RenderId current) const {
    return std::make_unique<OcctBrepRenderer>(static_cast<OcctPartContainer const&>(part), builder,
                                              std::move(current));
}

} // namespace VizBridgeStep

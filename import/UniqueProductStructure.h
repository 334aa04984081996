#pragma once

#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/model/VizProductStructure.h>

#include <memory>

// VizBuilder::MakeVizProductStructure for hosts that hold what they own in std::unique_ptr:
// the structure comes back owned, so that a host never deletes it by hand.

namespace VizBridgeTarvex {

/// The assembly form. With the scene library's throw switch on, a failure in the instance
/// tree reaches the caller, and the structure built so far is freed on the way.
inline std::unique_ptr<VizProductStructure>
MakeUniqueVizProductStructure(TarvexPSImportResult const& result,
                              TarvexInputProductStructure const& input, TarvexDocument& document) {
    VizProductStructure* made = nullptr;
    try {
        VizBuilder::MakeVizProductStructure(result, input, document, made);
    } catch (...) {
        std::unique_ptr<VizProductStructure> const built(made); // handed over before the throw
        throw;
    }
    return std::unique_ptr<VizProductStructure>(made);
}

/// One part around `container`, which the structure takes; document strings from the import
/// library.
inline std::unique_ptr<VizProductStructure>
MakeUniqueVizProductStructure(TarvexPSImportResult const& result,
                              TarvexInputProductStructure const& input, TarvexDocument& document,
                              std::unique_ptr<VizPartContainer> container) {
    VizProductStructure* made = nullptr;
    try {
        VizBuilder::MakeVizProductStructure(result, input, document, container.release(), made);
    } catch (...) {
        std::unique_ptr<VizProductStructure> const built(made);
        throw;
    }
    return std::unique_ptr<VizProductStructure>(made);
}

/// One part around `container`, which the structure takes, with the host's document strings;
/// null for a null container.
inline std::unique_ptr<VizProductStructure>
MakeUniqueVizProductStructure(VizDocumentInfo const& info,
                              std::unique_ptr<VizPartContainer> container) {
    VizProductStructure* made = nullptr;
    VizBuilder::MakeVizProductStructure(info, container.release(), made);
    return std::unique_ptr<VizProductStructure>(made);
}

} // namespace VizBridgeTarvex

#pragma once

#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/services/VizModelerServices.h>

#include <memory>

// The modeler services' operations that hand a new object to the caller, in a form that
// holds it in std::unique_ptr, so that neither the system nor a host deletes one by hand.

namespace VizBridgeTarvex {

/// A Clone of `services`, owned; null for null services or a Clone that gave null.
inline std::unique_ptr<VizModelerServices> CloneUnique(VizModelerServices* services) {
    return std::unique_ptr<VizModelerServices>(services ? services->Clone() : nullptr);
}

/// The renderer that `services` makes for `container`, owned; null where CreateRenderer
/// gives null.
inline std::unique_ptr<KolbaVizCore::ARenderer>
CreateUniqueRenderer(VizModelerServices& services, VizPartContainer* container,
                     KolbaVizCore::SceneBuilder* builder, RenderId* current) {
    return std::unique_ptr<KolbaVizCore::ARenderer>(
        services.CreateRenderer(container, builder, current));
}

} // namespace VizBridgeTarvex

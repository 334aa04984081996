#pragma once

#include <VizBridge/render/TarvexRenderer.h>

#include <memory>

namespace VizBridgeTarvex {

/// TarvexRenderer::MakeRenderer for hosts that hold what they own in std::unique_ptr; null
/// where MakeRenderer gives null. The renderer must still go before the structure and the
/// SceneBuilder it points at.
inline std::unique_ptr<TarvexRenderer>
MakeUniqueRenderer(VizProductStructure* structure, VizModelerServices* services,
                   KolbaVizCore::SceneBuilder* builder, double const& x = 0.0,
                   double const& y = 0.0, double const& z = 0.0) {
    return std::unique_ptr<TarvexRenderer>(
        TarvexRenderer::MakeRenderer(structure, services, builder, x, y, z));
}

} // namespace VizBridgeTarvex

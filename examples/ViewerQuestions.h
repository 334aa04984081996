#pragma once

#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/RenderId.h>

#include <ostream>

namespace KolbaVizCore {
class AView3DAdapter;
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {
class TarvexRenderer;
} // namespace VizBridgeTarvex

namespace VizBridgeExamples {

/// The ray from `origin` along `direction`.
KolbaVizCore::Ray MakeRay(double const (&origin)[3], double const (&direction)[3]);

/// What a viewer asks the renderer about the node a ray picks: prints its render id, the
/// entity id it names, the paths to highlight, the tool tip, and the path the entity id
/// converts back to. Paths print with the product's tag as T. `view` picks in `scene`, which
/// `renderer` drew into.
void PrintViewerQuestions(std::ostream& out, VizBridgeTarvex::TarvexRenderer& renderer,
                          KolbaVizCore::SceneBuilder const& scene,
                          KolbaVizCore::AView3DAdapter& view, char const* what,
                          KolbaVizCore::Ray const& ray);

/// The same questions about a path the host knows, such as an instance's.
void PrintViewerQuestions(std::ostream& out, VizBridgeTarvex::TarvexRenderer& renderer,
                          KolbaVizCore::SceneBuilder const& scene, char const* what,
                          KolbaVizCore::RenderId const& picked);

} // namespace VizBridgeExamples

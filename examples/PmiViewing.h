#pragma once

#include <ostream>
#include <string>

namespace KolbaVizCore {
class AView3DAdapter;
class VizPMIContainer;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {
class VizProductStructure;
} // namespace VizBridgeTarvex

namespace VizBridgeExamples {

// What the demo host does with the PMI of a rendered structure: print its part of the scene
// tree, ask what lies under a ray, and activate a capture and a view.

/// The subtrees "PMI", "Views" and "Captures" of a scene dump, as the dump gives them.
void PrintPMIScene(std::ostream& out, std::string const& dump);

/// Picks along the ray from `origin` along `direction` and prints the element and the
/// instance that were hit.
void PrintPick(std::ostream& out, VizBridgeTarvex::VizProductStructure const& structure,
               KolbaVizCore::AView3DAdapter& view, char const* what, double const (&origin)[3],
               double const (&direction)[3]);

/// Activates the first capture of `container`, then its first view, and prints which of its
/// PMI show after each.
void ActivateAndPrint(std::ostream& out, VizBridgeTarvex::VizProductStructure& structure,
                      KolbaVizCore::VizPMIContainer const& container);

} // namespace VizBridgeExamples

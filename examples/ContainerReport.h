#pragma once

#include <ostream>

namespace KolbaVizCore {
class VizContainer;
class VizPMIContainer;
} // namespace KolbaVizCore

namespace VizBridgeExamples {

// What the demo host prints of the containers that a visualisation import made: a line per
// list and a line per element, enough to see colours, hidden states, texts (or the strokes
// and glyph faces they were tessellated into) and the mechanical ids of PMI links.

void PrintVizContainer(std::ostream& out, KolbaVizCore::VizContainer const& container);
void PrintVizPMIContainer(std::ostream& out, KolbaVizCore::VizPMIContainer const& container);

} // namespace VizBridgeExamples

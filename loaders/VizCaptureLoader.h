#pragma once

#include <VizBridge/contracts/kolba/AVizCaptureLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one capture: its hidden and active states, its camera, name, ids, hidden text and
/// clipping plane, and as member keys the ids of its annotations, then those of its FTA
/// constructed geometry, then, if it manages geometry, the paths of the bodies it shows: the names
/// of the instances above a body, outermost first, each followed by "<KolbaSlash>" when there are
/// two or more, and then the visual id of the part entity it ends in.
class VizCaptureLoader
    : public VizSourceLoader<KolbaVizCore::AVizCaptureLoader, TarvexVisuCapture> {
public:
    VizCaptureLoader(TarvexVisuCapture const& source, std::vector<TarvexVisuAttributes>* attributes,
                     bool const& inheritAttributes);
    ~VizCaptureLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

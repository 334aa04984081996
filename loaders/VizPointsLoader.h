#pragma once

#include <VizBridge/contracts/kolba/AVizPointsLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPoints.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one group of loose points: its own colour and its points resolved from the index
/// array into a flat vertex list. Gives null for a group without indices.
class VizPointsLoader : public VizSourceLoader<KolbaVizCore::AVizPointsLoader, TarvexVisuPoints> {
public:
    /// `attributes` may be null. With `inheritAttributes`, a colour or alpha the points lack
    /// is taken from the stack.
    VizPointsLoader(TarvexVisuPoints const& source, std::vector<TarvexVisuAttributes>* attributes,
                    bool const& inheritAttributes);
    ~VizPointsLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

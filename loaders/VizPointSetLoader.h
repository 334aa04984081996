#pragma once

#include <VizBridge/contracts/kolba/AVizPointSetLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads a point set: its groups of points, which always inherit colour and alpha from the
/// attribute stack. A point set has no id of its own.
class VizPointSetLoader
    : public VizSourceLoader<KolbaVizCore::AVizPointSetLoader, TarvexVisuPointSet> {
public:
    /// `attributes` may be null. The flag changes nothing: a set's points always inherit.
    VizPointSetLoader(TarvexVisuPointSet const& source,
                      std::vector<TarvexVisuAttributes>* attributes, bool const& inheritAttributes);
    ~VizPointSetLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

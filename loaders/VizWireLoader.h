#pragma once

#include <VizBridge/contracts/kolba/AVizWireLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads a wire: its visual id and its edges. The edges always inherit colour and alpha from
/// the attribute stack; the wire's own colour is set by whoever places it in the scene.
class VizWireLoader : public VizSourceLoader<KolbaVizCore::AVizWireLoader, TarvexVisuWire> {
public:
    /// `attributes` may be null. The flag changes nothing: a wire's edges always inherit.
    VizWireLoader(TarvexVisuWire const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizWireLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

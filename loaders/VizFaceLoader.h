#pragma once

#include <VizBridge/contracts/kolba/AVizFaceLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFace.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one face: its visual and mechanical ids, its own colour (inheriting a missing colour or
/// alpha from the attribute stack, always), its vertex and normal arrays (copied) and its
/// polygons.
class VizFaceLoader : public VizSourceLoader<KolbaVizCore::AVizFaceLoader, TarvexVisuFace> {
public:
    /// `attributes` may be null. `inheritAttributes` is only handed on to the polygons: the
    /// face's own colour inherits from the stack whatever the flag says.
    VizFaceLoader(TarvexVisuFace const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizFaceLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

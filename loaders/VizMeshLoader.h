#pragma once

#include <VizBridge/contracts/kolba/AVizMeshLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads a tessellated body: its visual and mechanical ids, then its faces, then its edges.
/// The mesh's own colour is set by whoever places it in the scene.
class VizMeshLoader : public VizSourceLoader<KolbaVizCore::AVizMeshLoader, TarvexVisuMesh> {
public:
    /// `attributes` may be null. `inheritAttributes` is handed on to the faces and the edges;
    /// as a face inherits its own colour anyway, it decides the colour of the edges only.
    VizMeshLoader(TarvexVisuMesh const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizMeshLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

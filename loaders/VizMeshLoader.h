#pragma once

#include "contracts/kolba/AVizMeshLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuMesh.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads a tessellated body: its visual and mechanical ids, then its faces, then its edges.
/// The mesh's own colour is set by whoever places it in the scene.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizMeshLoader : public KolbaVizCore::AVizMeshLoader {
public:
    /// `attributes` may be null. `inheritAttributes` is handed on to the faces and the edges;
    /// as a face inherits its own colour anyway, it decides the colour of the edges only.
    VizMeshLoader(TarvexVisuMesh const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizMeshLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuMesh const* m_source;
};

} // namespace VizBridgeTarvex

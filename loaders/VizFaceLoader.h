#pragma once

#include "contracts/kolba/AVizFaceLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuFace.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads one face: its visual and mechanical ids, its own colour (inheriting a missing colour or
/// alpha from the attribute stack, always), its vertex and normal arrays (copied) and its
/// polygons.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizFaceLoader : public KolbaVizCore::AVizFaceLoader {
public:
    /// `attributes` may be null. `inheritAttributes` is only handed on to the polygons: the
    /// face's own colour inherits from the stack whatever the flag says.
    VizFaceLoader(TarvexVisuFace const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizFaceLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuFace const* m_source;
};

} // namespace VizBridgeTarvex

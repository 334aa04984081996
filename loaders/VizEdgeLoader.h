#pragma once

#include "contracts/kolba/AVizEdgeLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuEdge.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads one edge of a mesh, wire, PMI or stroked text: its mechanical id, its line type, its
/// own colour, and its points resolved from the index array into a flat vertex list (a
/// closed line repeats its first point at the end). Gives null for an edge without indices.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizEdgeLoader : public KolbaVizCore::AVizEdgeLoader {
public:
    /// `attributes` may be null. With `inheritAttributes`, a colour or alpha the edge lacks
    /// is taken from the stack.
    VizEdgeLoader(TarvexVisuEdge const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizEdgeLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuEdge const* m_source;
};

} // namespace VizBridgeTarvex

#pragma once

#include <VizBridge/contracts/kolba/AVizEdgeLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one edge of a mesh, wire, PMI or stroked text: its mechanical id, its line type, its
/// own colour, and its points resolved from the index array into a flat vertex list (a
/// closed line repeats its first point at the end). Gives null for an edge without indices.
class VizEdgeLoader : public VizSourceLoader<KolbaVizCore::AVizEdgeLoader, TarvexVisuEdge> {
public:
    /// `attributes` may be null. With `inheritAttributes`, a colour or alpha the edge lacks
    /// is taken from the stack.
    VizEdgeLoader(TarvexVisuEdge const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizEdgeLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The edges of a mesh, wire or PMI, or the strokes of a laid-out text.
class TarvexVisuEdgeIter
    : public TarvexVisuIterator<TarvexVisuEdgeIter, TarvexVisuEdge, TarvexAuthoredVisuEdge> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuEdgeIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuEdgeIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuEdgeIter::Current";
};

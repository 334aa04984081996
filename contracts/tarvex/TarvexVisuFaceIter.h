#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFace.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The faces of a mesh, or the filled glyphs of a laid-out text.
class TarvexVisuFaceIter
    : public TarvexVisuIterator<TarvexVisuFaceIter, TarvexVisuFace, TarvexAuthoredVisuFace> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuFaceIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuFaceIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuFaceIter::Current";
};

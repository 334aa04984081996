#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPoints.h>

/// The points of a point set.
class TarvexVisuPointsIter
    : public TarvexVisuIterator<TarvexVisuPointsIter, TarvexVisuPoints, TarvexAuthoredVisuPoints> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuPointsIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuPointsIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuPointsIter::Current";
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuView.h>

/// The views of visualisation data.
class TarvexVisuViewIter
    : public TarvexVisuIterator<TarvexVisuViewIter, TarvexVisuView, TarvexAuthoredVisuView> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuViewIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuViewIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuViewIter::Current";
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The captures of visualisation data.
class TarvexVisuCaptureIter : public TarvexVisuIterator<TarvexVisuCaptureIter, TarvexVisuCapture,
                                                        TarvexAuthoredVisuCapture> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuCaptureIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuCaptureIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuCaptureIter::Current";
};

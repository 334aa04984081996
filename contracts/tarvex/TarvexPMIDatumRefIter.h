#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumRef.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The datum references of a frame: primary, secondary, tertiary.
class TarvexPMIDatumRefIter : public TarvexVisuIterator<TarvexPMIDatumRefIter, TarvexPMIDatumRef,
                                                        TarvexAuthoredPMIDatumRef> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexPMIDatumRefIter::GetCount";
    static constexpr char const* kNext = "TarvexPMIDatumRefIter::Next";
    static constexpr char const* kCurrent = "TarvexPMIDatumRefIter::Current";
};

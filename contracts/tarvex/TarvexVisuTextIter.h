#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuText.h>

/// The texts of a PMI.
class TarvexVisuTextIter
    : public TarvexVisuIterator<TarvexVisuTextIter, TarvexVisuText, TarvexAuthoredVisuText> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuTextIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuTextIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuTextIter::Current";
};

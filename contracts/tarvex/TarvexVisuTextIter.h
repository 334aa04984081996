#pragma once

#include "contracts/tarvex/TarvexAuthoredVisuPMI.h"
#include "contracts/tarvex/TarvexVisuIterator.h"
#include "contracts/tarvex/TarvexVisuText.h"

/// The texts of a PMI.
class TarvexVisuTextIter
    : public TarvexVisuIterator<TarvexVisuTextIter, TarvexVisuText, TarvexAuthoredVisuText> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuTextIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuTextIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuTextIter::Current";
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMILeader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The leaders of an annotation, in the order they were authored.
class TarvexPMILeaderIter
    : public TarvexVisuIterator<TarvexPMILeaderIter, TarvexPMILeader, TarvexAuthoredPMILeader> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexPMILeaderIter::GetCount";
    static constexpr char const* kNext = "TarvexPMILeaderIter::Next";
    static constexpr char const* kCurrent = "TarvexPMILeaderIter::Current";
};

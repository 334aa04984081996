#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>

/// The nodes of visualisation data, in walk order.
class TarvexVisuNodeIter
    : public TarvexVisuIterator<TarvexVisuNodeIter, TarvexVisuNode, TarvexAuthoredVisuNode> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuNodeIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuNodeIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuNodeIter::Current";
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumTarget.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The targets of a datum, in the order they were authored.
class TarvexPMIDatumTargetIter
    : public TarvexVisuIterator<TarvexPMIDatumTargetIter, TarvexPMIDatumTarget,
                                std::shared_ptr<TarvexAuthoredPMIDatumTarget const>> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexPMIDatumTargetIter::GetCount";
    static constexpr char const* kNext = "TarvexPMIDatumTargetIter::Next";
    static constexpr char const* kCurrent = "TarvexPMIDatumTargetIter::Current";

    static TarvexPMIDatumTarget MakeItem(
        TarvexVisuContext const& context,
        std::shared_ptr<std::shared_ptr<TarvexAuthoredPMIDatumTarget const> const> const& target) {
        return TarvexPMIDatumTarget(context, *target);
    }
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumRef.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The datums of one datum reference.
class TarvexPMIDatumRefModifiedDatumIter
    : public TarvexVisuIterator<TarvexPMIDatumRefModifiedDatumIter,
                                TarvexPMIDatumRef::ModifiedDatum, TarvexAuthoredPMIModifiedDatum> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexPMIDatumRefModifiedDatumIter::GetCount";
    static constexpr char const* kNext = "TarvexPMIDatumRefModifiedDatumIter::Next";
    static constexpr char const* kCurrent = "TarvexPMIDatumRefModifiedDatumIter::Current";

    static TarvexPMIDatumRef::ModifiedDatum
    MakeItem(TarvexVisuContext const& context,
             std::shared_ptr<TarvexAuthoredPMIModifiedDatum const> const& datum) {
        return {TarvexPMIDatum(context, datum->datum), datum->modifier};
    }
};

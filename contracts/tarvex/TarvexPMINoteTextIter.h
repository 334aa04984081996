#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMINote.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

/// The texts of a note, in the order they were authored.
class TarvexPMINoteTextIter : public TarvexVisuIterator<TarvexPMINoteTextIter, TarvexPMINote::Text,
                                                        TarvexAuthoredPMINoteText> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexPMINoteTextIter::GetCount";
    static constexpr char const* kNext = "TarvexPMINoteTextIter::Next";
    static constexpr char const* kCurrent = "TarvexPMINoteTextIter::Current";

    static TarvexPMINote::Text
    MakeItem(TarvexVisuContext const&,
             std::shared_ptr<TarvexAuthoredPMINoteText const> const& text);
};

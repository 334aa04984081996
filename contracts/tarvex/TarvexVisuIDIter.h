#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

/// Ids of the members of a view or capture: annotations, or constructed geometry.
class TarvexVisuIDIter
    : public TarvexVisuIterator<TarvexVisuIDIter, TarvexWString, VizPort::WString> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuIDIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuIDIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuIDIter::Current";

    static TarvexWString MakeItem(TarvexVisuContext const&,
                                  std::shared_ptr<VizPort::WString const> const& id) {
        return TarvexWString(*id);
    }
};

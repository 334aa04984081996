#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredEntity.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>

#include <memory>

/// Entities: the elements a PMI is linked to, or the bodies a capture shows. Each entity
/// belongs to the model of the iterator.
class TarvexEntityIter
    : public TarvexVisuIterator<TarvexEntityIter, TarvexEntity, TarvexAuthoredEntity> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexEntityIter::GetCount";
    static constexpr char const* kNext = "TarvexEntityIter::Next";
    static constexpr char const* kCurrent = "TarvexEntityIter::Current";

    static TarvexEntity MakeItem(TarvexVisuContext const& context,
                                 std::shared_ptr<TarvexAuthoredEntity const> const& entity) {
        return TarvexEntity(context.Model(), *entity);
    }
};

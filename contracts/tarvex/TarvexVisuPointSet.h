#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuGeometryType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointsIter.h>

#include <memory>

struct TarvexAuthoredVisuPointSet;

/// Groups of loose points. A default object is an empty set of unknown geometry type.
class TarvexVisuPointSet {
public:
    TarvexVisuPointSet() = default;
    TarvexVisuPointSet(TarvexVisuContext context,
                       std::shared_ptr<TarvexAuthoredVisuPointSet const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    TarvexVisuGeometryType GetGeometryType() const;
    TarvexVisuPointsIter GetPointsIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuPointSet const> m_record; ///< shares the import's data
};

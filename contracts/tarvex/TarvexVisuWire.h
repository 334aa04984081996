#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuGeometryType.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuWire;

/// Loose edges. A default object is an empty wire of unknown geometry type.
class TarvexVisuWire {
public:
    TarvexVisuWire() = default;
    TarvexVisuWire(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuWire const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetID(TarvexWString& id) const;
    TarvexVisuGeometryType GetGeometryType() const;
    TarvexVisuEdgeIter GetEdgeIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuWire const> m_record; ///< shares the import's data
};

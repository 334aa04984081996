#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuPMI;

/// A tessellated PMI: lines, texts, names and the entities it points at. A default object is
/// an empty PMI without names.
class TarvexVisuPMI {
public:
    TarvexVisuPMI() = default;
    TarvexVisuPMI(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuPMI const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    TarvexVisuEdgeIter GetEdgeIterator() const;
    TarvexVisuTextIter GetTextIterator() const;
    /// No text when the PMI has no display name.
    TarvexWString GetDisplayName() const;
    bool GetID(TarvexWString& id) const;
    bool GetMechanicalID(TarvexWString& id) const;
    /// The entities the PMI points at, in order.
    TarvexEntityIter GetLinkedElementIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuPMI const> m_record; ///< shares the import's data
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuCaptureIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNodeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuViewIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationData.h>

#include <memory>

struct TarvexAuthoredVisuData;

/// The visualisation data of one part document, as an import read it. A default object has
/// no nodes, views or captures and an unknown unit.
class TarvexVisuData : public TarvexVisualizationData {
public:
    TarvexVisuData() = default;
    TarvexVisuData(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuData const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}
    TarvexVisuData(TarvexVisuData const&) = default;
    TarvexVisuData& operator=(TarvexVisuData const&) = default;

    TarvexVisuNodeIter GetNodeIterator() const override;
    TarvexLengthUnitType GetUnits() const override;
    TarvexVisuViewIter GetViewIterator() const override;
    TarvexVisuCaptureIter GetCaptureIterator() const override;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuData const> m_record; ///< the import's own copy
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuData.h>

/// What an import of visualisation data gives. A default object holds empty data.
class TarvexVisuImportResult {
public:
    TarvexVisuImportResult() = default;
    TarvexVisuImportResult(TarvexVisuContext context, TarvexVisuData data)
        : m_context(std::move(context)), m_data(std::move(data)) {}

    TarvexVisuData GetVisualizationData() const;

private:
    TarvexVisuContext m_context;
    TarvexVisuData m_data;
};

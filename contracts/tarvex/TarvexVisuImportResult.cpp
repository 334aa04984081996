#include <VizBridge/contracts/tarvex/TarvexVisuImportResult.h>

TarvexVisuData TarvexVisuImportResult::GetVisualizationData() const {
    m_context.Check("TarvexVisuImportResult::GetVisualizationData");
    return m_data;
}

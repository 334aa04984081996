#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

void TarvexVisuContext::Check(char const* operation) const {
    if (m_model) {
        m_model->faults.Check(operation, m_subject);
    }
}

#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

TarvexPMIData TarvexPartImportResult::GetPMIData() const {
    // Until the modeler set it, the result belongs to no model, and no plan can make it throw.
    if (m_pmiData.m_data) {
        m_pmiData.m_data->faults.Check("TarvexPartImportResult::GetPMIData", 0);
    }
    return m_pmiData;
}

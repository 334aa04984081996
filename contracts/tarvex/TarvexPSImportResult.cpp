#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

TarvexInputPSMissingFileIter TarvexPSImportResult::GetMissingFileIterator() const {
    if (!m_data) {
        return TarvexInputPSMissingFileIter();
    }
    m_data->faults.Check("TarvexPSImportResult::GetMissingFileIterator", 0);
    return TarvexInputPSMissingFileIter(m_data);
}

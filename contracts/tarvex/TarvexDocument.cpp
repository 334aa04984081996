#include <VizBridge/contracts/tarvex/TarvexDocument.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

TarvexDocumentInformation TarvexDocument::GetInformation() {
    if (!m_data) {
        return TarvexDocumentInformation();
    }
    m_data->faults.Check("TarvexDocument::GetInformation", 0);
    return TarvexDocumentInformation(m_data);
}

#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

bool TarvexVisuEntity::GetID(TarvexWString& id) const {
    if (m_data) {
        m_data->faults.Check("TarvexVisuEntity::GetID", 0);
    }
    if (!m_id) {
        return false;
    }
    id = TarvexWString(*m_id);
    return true;
}

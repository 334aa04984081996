#include "contracts/tarvex/TarvexEntity.h"

#include "contracts/tarvex/TarvexInstanceEntity.h"
#include "contracts/tarvex/TarvexModelData.h"

bool TarvexEntity::GetInstanceEntity(TarvexInstanceEntity& instanceEntity) const {
    if (!m_data) {
        return false;
    }
    m_data->faults.Check("TarvexEntity::GetInstanceEntity", 0);
    if (m_instancePath.empty()) {
        return false;
    }
    // One level down: the first instance of the path, and the entity as its reference sees it.
    std::vector<unsigned int> rest(m_instancePath.begin() + 1, m_instancePath.end());
    instanceEntity = TarvexInstanceEntity(TarvexInputPSInstance(m_data, m_instancePath.front()),
                                          TarvexEntity(m_data, std::move(rest), m_entityId));
    return true;
}

unsigned int TarvexEntity::GetEntityId() const {
    if (!m_data) {
        return m_entityId;
    }
    m_data->faults.Check("TarvexEntity::GetEntityId", 0);
    return m_entityId;
}

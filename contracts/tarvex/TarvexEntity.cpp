#include <VizBridge/contracts/tarvex/TarvexEntity.h>

#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>

bool TarvexEntity::GetInstanceEntity(TarvexInstanceEntity& instanceEntity) const {
    if (!m_data) {
        return false;
    }
    m_data->faults.Check("TarvexEntity::GetInstanceEntity", 0);
    if (m_entity.instancePath.empty()) {
        return false;
    }
    // One level down: the first instance of the path, and the entity as its reference sees it.
    TarvexAuthoredEntity rest = m_entity;
    rest.instancePath.erase(rest.instancePath.begin());
    instanceEntity =
        TarvexInstanceEntity(TarvexInputPSInstance(m_data, m_entity.instancePath.front()),
                             TarvexEntity(m_data, std::move(rest)));
    return true;
}

bool TarvexEntity::isPartEntity() const {
    return m_entity.instancePath.empty() && m_entity.endsInPart;
}

bool TarvexEntity::GetPartEntity(TarvexVisuEntity& partEntity) const {
    if (!m_data) {
        return false;
    }
    m_data->faults.Check("TarvexEntity::GetPartEntity", 0);
    if (!isPartEntity()) {
        return false;
    }
    partEntity = TarvexVisuEntity(m_data, m_entity.visualId);
    return true;
}

bool TarvexEntity::GetPartEntity(TarvexEntity& partEntity) const {
    if (!m_data) {
        return false;
    }
    m_data->faults.Check("TarvexEntity::GetPartEntity", 0);
    if (!isPartEntity()) {
        return false;
    }
    partEntity = *this;
    return true;
}

unsigned int TarvexEntity::GetEntityId() const {
    if (!m_data) {
        return m_entity.entityId;
    }
    m_data->faults.Check("TarvexEntity::GetEntityId", 0);
    return m_entity.entityId;
}

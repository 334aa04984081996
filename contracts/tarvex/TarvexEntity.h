#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>

#include <memory>
#include <vector>

class TarvexInstanceEntity;
class TarvexModelData;

/// An entity of the model: a face or edge of a part, reached from the product through a path
/// of instances (their authoring ids, top first). An empty path: the entity lies in the part
/// itself, and is a part entity unless it was authored as ending in none. A default object is
/// no entity.
class TarvexEntity {
public:
    TarvexEntity() = default;
    TarvexEntity(std::shared_ptr<TarvexModelData const> data,
                 std::vector<unsigned int> instancePath, unsigned int entityId)
        : m_data(std::move(data)) {
        m_entity.instancePath = std::move(instancePath);
        m_entity.entityId = entityId;
    }
    TarvexEntity(std::shared_ptr<TarvexModelData const> data, TarvexAuthoredEntity entity)
        : m_data(std::move(data)), m_entity(std::move(entity)) {}

    /// True and `instanceEntity` filled when the entity lies below an instance.
    bool GetInstanceEntity(TarvexInstanceEntity& instanceEntity) const;
    /// True and `partEntity` filled, with the visual id of what shows the entity, when it
    /// stands directly for an entity of a part.
    bool GetPartEntity(TarvexVisuEntity& partEntity) const;
    /// True and `partEntity` set to this entity when it stands directly for an entity of a
    /// part.
    bool GetPartEntity(TarvexEntity& partEntity) const;
    /// The entity's own id in its part (its authored face or edge id).
    unsigned int GetEntityId() const;

private:
    // An instance entity asks the fault plan of the model its entity belongs to.
    friend class TarvexInstanceEntity;

    bool isPartEntity() const;

    std::shared_ptr<TarvexModelData const> m_data;
    TarvexAuthoredEntity m_entity;
};

#pragma once

#include <memory>
#include <vector>

class TarvexInstanceEntity;
class TarvexModelData;

/// An entity of the model: a face or edge of a part, reached from the product through a path
/// of instances (their authoring ids, top first). An empty path: the entity lies in the part
/// itself. A default object is no entity.
class TarvexEntity {
public:
    TarvexEntity() = default;
    TarvexEntity(std::shared_ptr<TarvexModelData const> data,
                 std::vector<unsigned int> instancePath, unsigned int entityId)
        : m_data(std::move(data)), m_instancePath(std::move(instancePath)), m_entityId(entityId) {}

    /// True and `instanceEntity` filled when the entity lies below an instance.
    bool GetInstanceEntity(TarvexInstanceEntity& instanceEntity) const;
    /// The entity's own id in its part (its authored face or edge id).
    unsigned int GetEntityId() const;

private:
    // An instance entity asks the fault plan of the model its entity belongs to.
    friend class TarvexInstanceEntity;

    std::shared_ptr<TarvexModelData const> m_data;
    std::vector<unsigned int> m_instancePath;
    unsigned int m_entityId = 0;
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>

/// An entity seen from an instance: the instance, and the entity relative to that instance's
/// reference.
class TarvexInstanceEntity {
public:
    TarvexInstanceEntity() = default;
    TarvexInstanceEntity(TarvexInputPSInstance instance, TarvexEntity entity)
        : m_instance(std::move(instance)), m_entity(std::move(entity)) {}

    TarvexInputPSInstance GetInstance() const;
    TarvexEntity GetEntity() const;

private:
    TarvexInputPSInstance m_instance;
    TarvexEntity m_entity;
};

#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

namespace {

/// Asks the plan of the entity's model, if it has one, before `operation` answers.
void check(TarvexModelData const* data, char const* operation) {
    if (data != nullptr) {
        data->faults.Check(operation, 0);
    }
}

} // namespace

TarvexInputPSInstance TarvexInstanceEntity::GetInstance() const {
    check(m_entity.m_data.get(), "TarvexInstanceEntity::GetInstance");
    return m_instance;
}

TarvexEntity TarvexInstanceEntity::GetEntity() const {
    check(m_entity.m_data.get(), "TarvexInstanceEntity::GetEntity");
    return m_entity;
}

#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>

#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>

namespace {

/// Checks the plan for `operation` and gives the record, or null for a default object or an
/// id the model does not know.
TarvexAuthoredInstance const* find(TarvexModelData const* data, char const* operation,
                                   unsigned int instanceId) {
    if (data == nullptr) {
        return nullptr;
    }
    data->faults.Check(operation, instanceId);
    return data->FindInstance(instanceId);
}

} // namespace

TarvexInputPSReference TarvexInputPSInstance::GetReference() const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetReference", m_instanceId);
    return instance == nullptr ? TarvexInputPSReference()
                               : TarvexInputPSReference(m_data, instance->referenceId);
}

TarvexWString TarvexInputPSInstance::GetInstanceName() const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetInstanceName", m_instanceId);
    return instance == nullptr ? TarvexWString() : TarvexWString(instance->name);
}

bool TarvexInputPSInstance::GetInstancePositionMatrix(double (&rotation)[3][3],
                                                      double (&translation)[3]) const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetInstancePositionMatrix", m_instanceId);
    // Callers build a transformation from the arrays whatever the answer, so an absent
    // placement must still leave them meaningful.
    TarvexPlacement const placement =
        instance != nullptr && instance->placement ? *instance->placement : TarvexPlacement();
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            rotation[row][column] = placement.rotation[row][column];
        }
        translation[row] = placement.translation[row];
    }
    return instance != nullptr && instance->placement.has_value();
}

bool TarvexInputPSInstance::GetHidden(bool& hidden) const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetHidden", m_instanceId);
    if (instance == nullptr || !instance->hidden) {
        return false;
    }
    hidden = *instance->hidden;
    return true;
}

bool TarvexInputPSInstance::GetSuppressed(bool& suppressed) const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetSuppressed", m_instanceId);
    if (instance == nullptr || !instance->suppressed) {
        return false;
    }
    suppressed = *instance->suppressed;
    return true;
}

bool TarvexInputPSInstance::GetRGBColor(unsigned short& red, unsigned short& green,
                                        unsigned short& blue) const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetRGBColor", m_instanceId);
    if (instance == nullptr || !instance->rgb) {
        return false;
    }
    red = (*instance->rgb)[0];
    green = (*instance->rgb)[1];
    blue = (*instance->rgb)[2];
    return true;
}

bool TarvexInputPSInstance::GetAlphaColor(unsigned short& alpha) const {
    auto const* const instance =
        find(m_data.get(), "TarvexInputPSInstance::GetAlphaColor", m_instanceId);
    if (instance == nullptr || !instance->alpha) {
        return false;
    }
    alpha = *instance->alpha;
    return true;
}

#pragma once

#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexInputPSReference;
class TarvexModelData;

/// A placement of a reference. Optional getters answer whether the value is present and
/// leave their arguments alone when it is not. A default object is empty.
class TarvexInputPSInstance {
public:
    TarvexInputPSInstance() = default;
    TarvexInputPSInstance(std::shared_ptr<TarvexModelData const> data, unsigned int instanceId)
        : m_data(std::move(data)), m_instanceId(instanceId) {}

    TarvexInputPSReference GetReference() const;
    TarvexWString GetInstanceName() const;
    /// Fills the rotation (by rows) and translation; the identity when no placement is
    /// present, and then answers false.
    bool GetInstancePositionMatrix(double (&rotation)[3][3], double (&translation)[3]) const;
    bool GetHidden(bool& hidden) const;
    bool GetSuppressed(bool& suppressed) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
    unsigned int m_instanceId = 0;
};

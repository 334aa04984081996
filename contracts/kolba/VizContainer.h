#pragma once

#include "contracts/kolba/AVizContainer.h"

namespace KolbaVizCore {

/// Tessellated geometry of one reference. The element lists arrive with the element
/// family; the container owns what is added to it.
class VizContainer : public AVizContainer {
public:
    explicit VizContainer(int const& refId) : AVizContainer(refId) {}

    std::string GetTypeName() const override { return "VizContainer"; }

    /// Factor from the data's length unit to the scene's.
    void SetScaleFactor(double factor) { m_scaleFactor = factor; }
    double GetScaleFactor() const { return m_scaleFactor; }

private:
    double m_scaleFactor = 1.0;
};

} // namespace KolbaVizCore

#pragma once

#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <array>

namespace KolbaVizCore {

/// One point.
class PointItem : public GeometryItem {
public:
    PointItem(unsigned long tag, float x, float y, float z);

    std::array<float, 3> const& GetPosition() const { return m_position; }

    void AddToBox(Matrix4 const& world, VizBox& box) const override;

protected:
    std::string describeData() const override;
    bool intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                      double& t) const override;

private:
    std::array<float, 3> m_position;
};

} // namespace KolbaVizCore

#pragma once

#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <vector>

namespace KolbaVizCore {

/// A line through its points in order (three floats a point). Owns a copy of its floats.
class PolylineItem : public GeometryItem {
public:
    PolylineItem(unsigned long tag, std::vector<float> coordinates);

    std::vector<float> const& GetCoordinates() const { return m_coordinates; }
    std::size_t GetPointCount() const { return m_coordinates.size() / 3; }

    void AddToBox(Matrix4 const& world, VizBox& box) const override;

protected:
    std::string describeData() const override;
    bool intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                      double& t) const override;

private:
    std::vector<float> m_coordinates;
};

} // namespace KolbaVizCore

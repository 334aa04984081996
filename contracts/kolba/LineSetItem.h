#pragma once

#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <vector>

namespace KolbaVizCore {

/// Separate segments: points 0 and 1 make the first, 2 and 3 the next, and so on (three floats
/// a point); an unpaired last point draws nothing. Owns a copy of its floats.
class LineSetItem : public GeometryItem {
public:
    LineSetItem(unsigned long tag, std::vector<float> coordinates);

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

#pragma once

#include <VizBridge/contracts/kolba/IView3D.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <array>
#include <vector>

namespace KolbaVizCore {

/// A view that shows nothing and keeps every call, in order, for hosts without a viewer and
/// for tests.
class RecordingView3D : public IView3D {
public:
    struct Sphere {
        std::array<float, 3> center;
        float radius;
    };

    void SetGeometryExtents(float const* center, float const& radius) override;
    void SetGeometryExtents(VizBox const& box) override;
    void SetViewOption(int const& option) override;

    std::vector<Sphere> const& GetExtentSpheres() const { return m_spheres; }
    std::vector<VizBox> const& GetExtentBoxes() const { return m_boxes; }
    std::vector<int> const& GetViewOptions() const { return m_options; }
    void Clear();

private:
    std::vector<Sphere> m_spheres;
    std::vector<VizBox> m_boxes;
    std::vector<int> m_options;
};

} // namespace KolbaVizCore

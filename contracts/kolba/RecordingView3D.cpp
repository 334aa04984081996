#include <VizBridge/contracts/kolba/RecordingView3D.h>

namespace KolbaVizCore {

void RecordingView3D::SetGeometryExtents(float const* center, float const& radius) {
    // A missing centre is kept as the origin: the call itself is what a test looks for.
    Sphere sphere{{0.0f, 0.0f, 0.0f}, radius};
    if (center != nullptr)
        sphere.center = {center[0], center[1], center[2]};
    m_spheres.push_back(sphere);
}

void RecordingView3D::SetGeometryExtents(VizBox const& box) {
    m_boxes.push_back(box);
}

void RecordingView3D::SetViewOption(int const& option) {
    m_options.push_back(option);
}

void RecordingView3D::Clear() {
    m_spheres.clear();
    m_boxes.clear();
    m_options.clear();
}

} // namespace KolbaVizCore

#include <VizBridge/contracts/kolba/View3DAdapter.h>

#include <VizBridge/contracts/kolba/SceneBuilder.h>

namespace KolbaVizCore {

bool View3DAdapter::PickRenderId(Ray const& ray, RenderId& id) {
    double distance = 0.0;
    return m_scene != nullptr && m_scene->Pick(ray, id, distance);
}

} // namespace KolbaVizCore

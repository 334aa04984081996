#include <VizBridge/contracts/kolba/View3DAdapter.h>

#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>

#include <algorithm>

namespace KolbaVizCore {

bool View3DAdapter::PickRenderId(Ray const& ray, RenderId& id) {
    LastPick const& last = pick(ray);
    if (last.found)
        id = last.picked;
    return last.found;
}

bool View3DAdapter::PickDrawnRenderId(Ray const& ray, RenderId& id) {
    LastPick const& last = pick(ray);
    if (last.found)
        id = last.drawn;
    return last.found;
}

View3DAdapter::LastPick const& View3DAdapter::pick(Ray const& ray) {
    auto const same = [&ray](Ray const& other) {
        return std::equal(ray.origin, ray.origin + 3, other.origin) &&
               std::equal(ray.direction, ray.direction + 3, other.direction);
    };
    if (m_scene == nullptr) {
        m_last = LastPick{};
        return m_last;
    }
    if (m_last.valid && m_last.revision == m_scene->GetRevision() && same(m_last.ray))
        return m_last;
    m_last = LastPick{true, ray, m_scene->GetRevision(), false, RenderId(), RenderId()};
    double distance = 0.0;
    m_last.found = m_scene->Pick(ray, m_last.picked, distance);
    if (m_last.found) {
        Node const* const node = m_scene->FindNode(m_last.picked);
        m_last.drawn = node ? node->GetPath() : m_last.picked;
    }
    return m_last;
}

} // namespace KolbaVizCore

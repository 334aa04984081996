#include <VizBridge/contracts/kolba/VizContainer.h>

namespace KolbaVizCore {

bool VizContainer::PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element) {
    std::vector<VizElement*> candidates;
    addCandidates(m_meshes.Get(), candidates);
    addCandidates(m_cgMeshes.Get(), candidates);
    addCandidates(m_wires.Get(), candidates);
    addCandidates(m_cgWires.Get(), candidates);
    addCandidates(m_pointSets.Get(), candidates);
    addCandidates(m_cgPointSets.Get(), candidates);
    return pickAmong(view, ray, candidates, element);
}

} // namespace KolbaVizCore

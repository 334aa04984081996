#include <VizBridge/contracts/kolba/AVizContainer.h>

#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizWire.h>

namespace KolbaVizCore {

bool AVizContainer::PickVisual(AView3DAdapter*, Ray const&, VizElement*&) {
    return false;
}

bool AVizContainer::pickAmong(AView3DAdapter* view, Ray const& ray,
                              std::vector<VizElement*> const& candidates, VizElement*& element) {
    RenderId picked;
    if (view == nullptr || !view->PickDrawnRenderId(ray, picked))
        return false;
    // An element's items may stand in nodes below its own, so the picked path need only
    // begin with the element's; the deepest such element is the one shown there. The path
    // is the one drawn, so that an element shown again through a node reference is found.
    VizElement* best = nullptr;
    int bestLength = -1;
    for (VizElement* const candidate : candidates) {
        RenderId const* const path = candidate ? candidate->Find3DRenderID() : nullptr;
        if (path == nullptr)
            continue;
        if (path->Length() > bestLength && picked.BeginsWith(*path)) {
            best = candidate;
            bestLength = path->Length();
        }
    }
    if (best == nullptr)
        return false;
    element = best;
    return true;
}

void AVizContainer::addCandidates(std::vector<VizMesh*> const& meshes,
                                  std::vector<VizElement*>& candidates) {
    for (VizMesh* const mesh : meshes) {
        candidates.push_back(mesh);
        candidates.insert(candidates.end(), mesh->GetFaces().begin(), mesh->GetFaces().end());
        candidates.insert(candidates.end(), mesh->GetEdges().begin(), mesh->GetEdges().end());
    }
}

void AVizContainer::addCandidates(std::vector<VizWire*> const& wires,
                                  std::vector<VizElement*>& candidates) {
    for (VizWire* const wire : wires) {
        candidates.push_back(wire);
        candidates.insert(candidates.end(), wire->GetEdges().begin(), wire->GetEdges().end());
    }
}

void AVizContainer::addCandidates(std::vector<VizPointSet*> const& sets,
                                  std::vector<VizElement*>& candidates) {
    for (VizPointSet* const set : sets) {
        candidates.push_back(set);
        candidates.insert(candidates.end(), set->GetPointSets().begin(), set->GetPointSets().end());
    }
}

} // namespace KolbaVizCore

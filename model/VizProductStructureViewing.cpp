// What a viewer asks of a rendered structure without its renderer: what lies under a ray,
// and which view or capture is active, which decides what PMI shows.
#include <VizBridge/model/VizProductStructure.h>

#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/model/SameRenderId.h>
#include <VizBridge/model/VizPSEntry.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizPMICollection;

namespace {

/// The first element of `containers`, in key order, that the ray hits.
template <typename Container>
void pickIn(std::map<int, Container*> const& containers, KolbaVizCore::AView3DAdapter* view,
            KolbaVizCore::Ray const& ray, VizElement*& element) {
    for (auto const& [id, container] : containers) {
        if (!container)
            continue;
        VizElement* hit = nullptr;
        if (container->PickVisual(view, ray, hit)) {
            element = hit;
            return;
        }
    }
}

/// Keeps in `best` the deepest render id below `entry` that begins `picked`.
void deepestEntry(VizPSEntry* entry, RenderId const& picked, RenderId& best,
                  VizPSEntry*& bestEntry) {
    RenderId path;
    if (entry->Get3DRenderID(path)) {
        RenderId cut = picked;
        cut.SetLength(path.Length());
        if (SameRenderId(cut, path) && path.Length() > best.Length()) { // the first stays
            best = path;
            bestEntry = entry;
        }
    }
    for (VizPSEntry* const child : entry->GetChildren())
        if (child)
            deepestEntry(child, picked, best, bestEntry);
}

/// Reads whether each collection was active, and switches all but `keep` off.
template <typename Collection>
void switchOff(std::vector<Collection*> const& collections, VizPMICollection const* keep,
               bool& anyActive) {
    for (Collection* const collection : collections) {
        if (!collection)
            continue;
        if (collection->GetActive())
            anyActive = true;
        if (collection != keep)
            collection->SetActive(false);
    }
}

template <typename Collection>
bool activeMemberIn(std::vector<Collection*> const& collections, KolbaVizCore::VizPMI const& pmi) {
    for (Collection* const collection : collections)
        if (collection && collection->GetActive() && collection->IsMember(pmi))
            return true;
    return false;
}

/// Views and captures take turns: one of the kind of `chosen` stays as it was set, every
/// other collection goes off, and the PMI shown are the members of an active collection of
/// that kind in their own container. `anyActive` is read before anything is switched off,
/// so that switching off the last active collection leaves every PMI hidden; only when
/// nothing was active are they all shown.
bool activate(std::map<int, VizPMIContainer*> const& containers, VizPMICollection& chosen,
              bool const active, bool const chosenIsView) {
    chosen.SetActive(active);
    bool anyActive = false;
    for (auto const& [id, container] : containers) {
        if (!container)
            continue;
        for (KolbaVizCore::VizPMI* const pmi : container->GetVizPMIs())
            if (pmi)
                pmi->SetHidden(true);
        switchOff(container->GetViews(), chosenIsView ? &chosen : nullptr, anyActive);
        switchOff(container->GetCaptures(), chosenIsView ? nullptr : &chosen, anyActive);
    }
    for (auto const& [id, container] : containers) {
        if (!container)
            continue;
        for (KolbaVizCore::VizPMI* const pmi : container->GetVizPMIs()) {
            if (!pmi)
                continue;
            if (!anyActive)
                pmi->SetHidden(false);
            else if (chosenIsView ? activeMemberIn(container->GetViews(), *pmi)
                                  : activeMemberIn(container->GetCaptures(), *pmi))
                pmi->SetHidden(false);
        }
    }
    return true;
}

} // namespace

bool VizProductStructure::PickVisual(KolbaVizCore::AView3DAdapter* view,
                                     KolbaVizCore::Ray const& ray, VizElement*& element,
                                     VizPSEntry*& entry) const {
    if (!view)
        return false;
    pickIn(GetAllVizPMIContainers(), view, ray, element);
    if (!element) // the tessellated containers are not asked when a PMI was hit
        pickIn(GetAllVizContainers(), view, ray, element);
    RenderId picked;
    if (view->PickRenderId(ray, picked)) {
        RenderId best;
        VizPSEntry* bestEntry = nullptr;
        for (VizPSEntry* const root : m_rootEntries)
            if (root)
                deepestEntry(root, picked, best, bestEntry);
        if (bestEntry)
            entry = bestEntry;
    }
    return element != nullptr || entry != nullptr;
}

bool VizProductStructure::SetActive(KolbaVizCore::VizCapture& capture, bool const& active) {
    return activate(GetAllVizPMIContainers(), capture, active, false);
}

bool VizProductStructure::SetActive(KolbaVizCore::VizView& view, bool const& active) {
    return activate(GetAllVizPMIContainers(), view, active, true);
}

} // namespace VizBridgeTarvex

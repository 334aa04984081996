#include <VizBridge/contracts/kolba/VizPMIContainer.h>

#include <algorithm>

namespace KolbaVizCore {

bool VizPMIContainer::PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element) {
    std::vector<VizElement*> candidates;
    for (VizPMI* const pmi : m_pmis.Get()) {
        candidates.push_back(pmi);
        candidates.insert(candidates.end(), pmi->GetEdges().begin(), pmi->GetEdges().end());
        candidates.insert(candidates.end(), pmi->GetFaces().begin(), pmi->GetFaces().end());
        candidates.insert(candidates.end(), pmi->GetTexts().begin(), pmi->GetTexts().end());
    }
    addCandidates(m_ftaMeshes.Get(), candidates);
    addCandidates(m_ftaWires.Get(), candidates);
    addCandidates(m_ftaPointSets.Get(), candidates);
    candidates.insert(candidates.end(), m_views.Get().begin(), m_views.Get().end());
    candidates.insert(candidates.end(), m_captures.Get().begin(), m_captures.Get().end());
    return pickAmong(view, ray, candidates, element);
}

void VizPMIContainer::AddSemanticPMI(SemanticPMI* record) {
    if (record == nullptr)
        return;
    // Owned from here on, so that the record is freed even if filing it fails.
    std::unique_ptr<SemanticPMI> owned(record);
    std::unique_ptr<SemanticPMI>& slot = m_semanticPMI[owned->ID];
    if (slot == owned) {
        // Handed back while already filed here: it must stay alive.
        static_cast<void>(owned.release());
        return;
    }
    slot = std::move(owned);
}

bool VizPMIContainer::GetSemanticPMI(VizPort::WString const& key, SemanticPMI*& out) const {
    auto const found = m_semanticPMI.find(key);
    if (found == m_semanticPMI.end())
        return false;
    out = found->second.get();
    return true;
}

bool VizPMIContainer::GetSemanticPMIAsString(VizPort::WString const& key,
                                             VizPort::WString& text) const {
    auto const found = m_semanticPMI.find(key);
    if (found == m_semanticPMI.end())
        return false;
    text = found->second->ToString();
    return true;
}

VizPMI* VizPMIContainer::GetVizPMI(VizPort::WString const& mechanicalId) const {
    if (mechanicalId.empty())
        return nullptr;
    for (VizPMI* pmi : m_pmis.Get())
        if (pmi->GetMechanicalID() == mechanicalId)
            return pmi;
    return nullptr;
}

bool VizPMIContainer::GetBREPLinks(VizPort::WString const& mechanicalId,
                                   std::vector<EntityId>& links) const {
    auto const found = m_semanticPMI.find(mechanicalId);
    if (found == m_semanticPMI.end())
        return false;
    links = found->second->BREPLinks;
    return true;
}

bool VizPMIContainer::GetPMILinks(VizPort::WString const& mechanicalId,
                                  std::vector<VizPort::WString>& links) const {
    VizPMI const* const pmi = GetVizPMI(mechanicalId);
    if (pmi == nullptr)
        return false;
    std::vector<VizPort::WString> found;
    for (VizPort::WString const& linked : pmi->GetLinkedEntityMechIDs()) {
        // A link to a face or an edge has a mechanical id too: only PMI objects count here.
        if (GetVizPMI(linked) != nullptr &&
            std::find(found.begin(), found.end(), linked) == found.end())
            found.push_back(linked);
    }
    links = std::move(found);
    return true;
}

} // namespace KolbaVizCore

#pragma once

#include "model/VizTypes.h"

#include <memory>
#include <unordered_set>
#include <vector>

namespace VizBridgeTarvex {

class VizPartContainer;
class VizPSEntry;

/// The objects a product structure owns. Its copies share one of these, and the last of
/// them frees everything: the tessellated containers first, then the PMI containers, then
/// the part containers, then the entries.
class VizOwnedObjects {
public:
    VizOwnedObjects() = default;
    VizOwnedObjects(VizOwnedObjects const&) = delete;
    VizOwnedObjects& operator=(VizOwnedObjects const&) = delete;
    ~VizOwnedObjects();

    void Own(VizPSEntry* entry) { m_entries.emplace_back(entry); }
    void Own(VizContainer* container) { m_vizContainers.insert(container); }
    void Own(VizPMIContainer* container) { m_pmiContainers.insert(container); }
    void Own(VizPartContainer* container) { m_partContainers.insert(container); }
    /// Gives ownership back: the object is no longer freed here.
    void Release(VizPMIContainer* container) { m_pmiContainers.erase(container); }
    void Release(VizPartContainer* container) { m_partContainers.erase(container); }

private:
    std::vector<std::unique_ptr<VizPSEntry>> m_entries;
    std::unordered_set<VizContainer*> m_vizContainers;
    std::unordered_set<VizPMIContainer*> m_pmiContainers;
    std::unordered_set<VizPartContainer*> m_partContainers;
};

} // namespace VizBridgeTarvex

#include "model/VizProductStructure.h"

#include "model/VizOwnedObjects.h"
#include "model/VizPSEntry.h"
#include "model/VizPartContainer.h"

namespace VizBridgeTarvex {

namespace {
template <typename Container>
Container* findValue(std::map<int, Container*> const& map, int const& id) {
    auto const found = map.find(id);
    return found == map.end() ? nullptr : found->second;
}

/// Erases the first pair, in key order, whose value is `container`.
template <typename Container>
bool eraseFirst(std::map<int, Container*>& map, Container const* container) {
    for (auto it = map.begin(); it != map.end(); ++it) {
        if (it->second == container) {
            map.erase(it);
            return true;
        }
    }
    return false;
}
} // namespace

VizProductStructure::VizProductStructure(char16_t const* name)
    : m_owned(std::make_shared<VizOwnedObjects>()) {
    productName = name ? WString(name) : WString();
}

VizProductStructure::VizProductStructure(VizProductStructure const&) = default;
VizProductStructure& VizProductStructure::operator=(VizProductStructure const&) = default;
// The owned objects go with the last copy, in the order VizOwnedObjects keeps.
VizProductStructure::~VizProductStructure() = default;

VizPSEntry* VizProductStructure::GetSubAssembly(int const& id) const {
    // lower_bound, not find: with several instances the first one built must answer.
    auto const first = m_subAssemblies.lower_bound(id);
    return first != m_subAssemblies.end() && first->first == id ? first->second : nullptr;
}

VizPartContainer* VizProductStructure::GetVizPartContainer(int const& id) const {
    return findValue(m_vizPartContainers, id);
}

VizContainer* VizProductStructure::GetVizContainer(int const& id) const {
    return findValue(m_vizContainers, id);
}

VizPMIContainer* VizProductStructure::GetVizPMIContainer(int const& id) const {
    return findValue(m_vizPMIContainers, id);
}

bool VizProductStructure::IsVizLoaded(int const& id) const {
    return m_vizContainers.count(id) != 0 || m_vizPMIContainers.count(id) != 0;
}

bool VizProductStructure::IsSemanticInfoLoaded(int const& id) const {
    VizPMIContainer const* const container = GetVizPMIContainer(id);
    return container && container->HasSemanticPMI();
}

bool VizProductStructure::IsMissingFile(int const& id, WString& name) const {
    auto const found = m_missingReferences.find(id);
    if (found == m_missingReferences.end())
        return false;
    name = found->second;
    return true;
}

std::vector<WString> VizProductStructure::GetErrorMessages() const {
    std::vector<WString> messages;
    messages.reserve(m_importErrors.size() + m_visuErrors.size() + m_missingFiles.size());
    for (auto const& [id, text] : m_importErrors)
        messages.push_back(text);
    for (auto const& [id, text] : m_visuErrors)
        messages.push_back(text);
    for (WString const& name : m_missingFiles)
        messages.push_back(u"Missing File " + name);
    return messages;
}

bool VizProductStructure::GetSemanticPMI(WString const& key, SemanticPMI*& out) const {
    for (auto const& [id, container] : m_vizPMIContainers) {
        if (container && container->HasSemanticPMI() && container->GetSemanticPMI(key, out))
            return true;
    }
    return false;
}

WString VizProductStructure::GetSemanticPMIAsString(WString const& key) const {
    WString text;
    for (auto const& [id, container] : m_vizPMIContainers) {
        if (container && container->GetSemanticPMIAsString(key, text))
            break;
    }
    return text;
}

void VizProductStructure::RemoveVizPartContainer(VizPartContainer* container) {
    if (eraseFirst(m_vizPartContainers, container))
        m_owned->Release(container);
}

void VizProductStructure::RemoveVizPMIContainer(VizPMIContainer* container) {
    if (eraseFirst(m_vizPMIContainers, container))
        m_owned->Release(container);
}

WString VizProductStructure::ToString() const {
    WString text = u"Product: " + productName + u"\n";
    for (VizPSEntry const* entry : m_rootEntries)
        text += entry->ToString(1);
    return text;
}

void VizProductStructure::AddRootEntry(VizPSEntry* entry) {
    if (!entry)
        return;
    entry->SetProductStructure(this);
    m_rootEntries.push_back(entry);
}

void VizProductStructure::AddSubAssembly(int const& id, VizPSEntry* entry) {
    if (!entry)
        return;
    entry->SetProductStructure(this);
    m_owned->Own(entry);
    m_subAssemblies.emplace(id, entry);
}

void VizProductStructure::AddVizPartContainer(int const& id, VizPartContainer* container) {
    if (!container)
        return;
    m_owned->Own(container);
    m_vizPartContainers[id] = container;
}

void VizProductStructure::AddVizContainer(int const& id, VizContainer* container) {
    if (!container)
        return;
    m_owned->Own(container);
    m_vizContainers[id] = container;
}

void VizProductStructure::AddVizPMIContainer(int const& id, VizPMIContainer* container) {
    if (!container)
        return;
    m_owned->Own(container);
    m_vizPMIContainers[id] = container;
}

void VizProductStructure::AddSemanticPMI(int const& id, SemanticPMIByKey* records) {
    if (!records)
        return;
    VizPMIContainer* const container = GetVizPMIContainer(id);
    for (auto const& [key, record] : *records) {
        if (!record)
            continue;
        if (container)
            container->AddSemanticPMI(record); // the container owns it now
        else
            delete record; // nobody else would: the caller only deletes the map
    }
    records->clear();
}

} // namespace VizBridgeTarvex

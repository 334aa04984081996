#include <VizBridge/model/VizProductStructure.h>

#include <VizBridge/model/VizContainerStore.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizPartContainer.h>

#include <unordered_map>

namespace VizBridgeTarvex {

namespace {
template <typename Container>
Container* findValue(std::map<int, Container*> const& map, int const& id) {
    auto const found = map.find(id);
    return found == map.end() ? nullptr : found->second;
}
} // namespace

VizProductStructure::VizProductStructure(char16_t const* name)
    : m_containers(std::make_shared<VizContainerStore>()) {
    productName = name ? WString(name) : WString();
}

VizProductStructure::VizProductStructure(VizProductStructure const& other)
    : VizDocumentInfo(other), m_configurationName(other.m_configurationName),
      m_units(other.m_units), m_containerCount(other.m_containerCount),
      m_allBREPLoaded(other.m_allBREPLoaded), m_allVizLoaded(other.m_allVizLoaded),
      m_tesselatingText(other.m_tesselatingText), m_missingFiles(other.m_missingFiles),
      m_missingReferences(other.m_missingReferences), m_importErrors(other.m_importErrors),
      m_visuErrors(other.m_visuErrors), m_containers(other.m_containers) {
    copyEntries(other);
}

VizProductStructure& VizProductStructure::operator=(VizProductStructure const& other) {
    if (this == &other)
        return *this;
    copyEntries(other); // first: it may throw, and then this structure stays as it was
    static_cast<VizDocumentInfo&>(*this) = other;
    m_configurationName = other.m_configurationName;
    m_units = other.m_units;
    m_containerCount = other.m_containerCount;
    m_allBREPLoaded = other.m_allBREPLoaded;
    m_allVizLoaded = other.m_allVizLoaded;
    m_tesselatingText = other.m_tesselatingText;
    m_missingFiles = other.m_missingFiles;
    m_missingReferences = other.m_missingReferences;
    m_importErrors = other.m_importErrors;
    m_visuErrors = other.m_visuErrors;
    m_containers = other.m_containers;
    return *this;
}

// The containers go first (m_containers is the last member), then the entries.
VizProductStructure::~VizProductStructure() = default;

void VizProductStructure::copyEntries(VizProductStructure const& other) {
    std::unordered_map<VizPSEntry const*, VizPSEntry*> copies;
    std::multimap<int, std::unique_ptr<VizPSEntry>> entries;
    for (auto const& [id, entry] : other.m_subAssemblies) {
        auto copy = std::make_unique<VizPSEntry>(*entry);
        copy->SetProductStructure(this);
        copies.emplace(entry.get(), copy.get());
        entries.emplace(id, std::move(copy));
    }
    // An entry stands in the map once, so every child and root has its copy.
    auto const copyOf = [&copies](VizPSEntry* entry) {
        auto const found = copies.find(entry);
        return found == copies.end() ? entry : found->second;
    };
    for (auto& [id, entry] : entries) {
        for (VizPSEntry*& child : entry->m_children)
            child = copyOf(child);
    }
    std::vector<VizPSEntry*> roots;
    roots.reserve(other.m_rootEntries.size());
    for (VizPSEntry* const root : other.m_rootEntries)
        roots.push_back(copyOf(root));
    m_subAssemblies.swap(entries);
    m_rootEntries.swap(roots);
}

VizPSEntry* VizProductStructure::GetSubAssembly(int const& id) const {
    // lower_bound, not find: with several instances the first one built must answer.
    auto const first = m_subAssemblies.lower_bound(id);
    return first != m_subAssemblies.end() && first->first == id ? first->second.get() : nullptr;
}

std::map<int, VizPartContainer*> const& VizProductStructure::GetAllVizPartContainers() const {
    return m_containers->Parts();
}

std::map<int, VizContainer*> const& VizProductStructure::GetAllVizContainers() const {
    return m_containers->Geometry();
}

std::map<int, VizPMIContainer*> const& VizProductStructure::GetAllVizPMIContainers() const {
    return m_containers->PMI();
}

VizPartContainer* VizProductStructure::GetVizPartContainer(int const& id) const {
    return findValue(m_containers->Parts(), id);
}

VizContainer* VizProductStructure::GetVizContainer(int const& id) const {
    return findValue(m_containers->Geometry(), id);
}

VizPMIContainer* VizProductStructure::GetVizPMIContainer(int const& id) const {
    return findValue(m_containers->PMI(), id);
}

int VizProductStructure::GetNumberOfVizPartContainers() const {
    return static_cast<int>(m_containers->Parts().size());
}

int VizProductStructure::GetNumberOfVizContainers() const {
    return static_cast<int>(m_containers->Geometry().size());
}

int VizProductStructure::GetNumberOfVizPMIContainers() const {
    return static_cast<int>(m_containers->PMI().size());
}

bool VizProductStructure::IsVizLoaded(int const& id) const {
    return m_containers->Geometry().count(id) != 0 || m_containers->PMI().count(id) != 0;
}

bool VizProductStructure::IsBREPLoaded(int const& id) const {
    return m_containers->Parts().count(id) != 0;
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
    for (auto const& [id, container] : m_containers->PMI()) {
        if (container && container->HasSemanticPMI() && container->GetSemanticPMI(key, out))
            return true;
    }
    return false;
}

WString VizProductStructure::GetSemanticPMIAsString(WString const& key) const {
    WString text;
    for (auto const& [id, container] : m_containers->PMI()) {
        if (container && container->GetSemanticPMIAsString(key, text))
            break;
    }
    return text;
}

void VizProductStructure::RemoveVizPartContainer(VizPartContainer* container) {
    // The caller owns it again.
    static_cast<void>(m_containers->RemovePart(container).release());
}

void VizProductStructure::RemoveVizPMIContainer(VizPMIContainer* container) {
    // The caller owns it again.
    static_cast<void>(m_containers->RemovePMI(container).release());
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

void VizProductStructure::AddSubAssembly(int const& id, std::unique_ptr<VizPSEntry> entry) {
    if (!entry)
        return;
    entry->SetProductStructure(this);
    m_subAssemblies.emplace(id, std::move(entry));
}

void VizProductStructure::AddVizPartContainer(int const& id,
                                              std::unique_ptr<VizPartContainer> container) {
    m_containers->AddPart(id, std::move(container));
}

void VizProductStructure::AddVizContainer(int const& id, std::unique_ptr<VizContainer> container) {
    m_containers->AddGeometry(id, std::move(container));
}

void VizProductStructure::AddVizPMIContainer(int const& id,
                                             std::unique_ptr<VizPMIContainer> container) {
    m_containers->AddPMI(id, std::move(container));
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

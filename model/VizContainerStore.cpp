#include <VizBridge/model/VizContainerStore.h>

#include <VizBridge/model/VizPartContainer.h>

#include <algorithm>

namespace VizBridgeTarvex {

namespace {

template <typename Container>
void add(std::map<int, Container*>& map, std::vector<std::unique_ptr<Container>>& owned, int id,
         std::unique_ptr<Container> container) {
    Container const* const raw = container.get();
    map[id] = container.get();
    if (!container)
        return; // a null value under `id`, owning nothing
    // A container is owned once, whatever number of keys name it.
    if (std::none_of(owned.begin(), owned.end(),
                     [raw](auto const& held) { return held.get() == raw; }))
        owned.push_back(std::move(container));
    else
        static_cast<void>(container.release());
}

template <typename Container>
std::unique_ptr<Container> remove(std::map<int, Container*>& map,
                                  std::vector<std::unique_ptr<Container>>& owned,
                                  Container const* container) {
    auto const pair = std::find_if(map.begin(), map.end(), [container](auto const& entry) {
        return entry.second == container;
    });
    if (pair == map.end())
        return nullptr;
    map.erase(pair);
    auto const held = std::find_if(owned.begin(), owned.end(), [container](auto const& entry) {
        return entry.get() == container;
    });
    if (held == owned.end())
        return nullptr;
    std::unique_ptr<Container> released = std::move(*held);
    owned.erase(held);
    return released;
}

} // namespace

VizContainerStore::~VizContainerStore() {
    // Tessellated geometry, then PMI, then the modelers' containers.
    m_geometry.clear();
    m_ownedGeometry.clear();
    m_pmi.clear();
    m_ownedPMI.clear();
    m_parts.clear();
    m_ownedParts.clear();
}

void VizContainerStore::AddPart(int id, std::unique_ptr<VizPartContainer> container) {
    add(m_parts, m_ownedParts, id, std::move(container));
}

void VizContainerStore::AddGeometry(int id, std::unique_ptr<VizContainer> container) {
    add(m_geometry, m_ownedGeometry, id, std::move(container));
}

void VizContainerStore::AddPMI(int id, std::unique_ptr<VizPMIContainer> container) {
    add(m_pmi, m_ownedPMI, id, std::move(container));
}

std::unique_ptr<VizPartContainer> VizContainerStore::RemovePart(VizPartContainer const* container) {
    return remove(m_parts, m_ownedParts, container);
}

std::unique_ptr<VizPMIContainer> VizContainerStore::RemovePMI(VizPMIContainer const* container) {
    return remove(m_pmi, m_ownedPMI, container);
}

} // namespace VizBridgeTarvex

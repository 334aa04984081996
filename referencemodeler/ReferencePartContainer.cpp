#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include <utility>

namespace VizReferenceModeler {

ReferencePartContainer::ReferencePartContainer(WString const& name, int const& refId,
                                               std::shared_ptr<TarvexConvertedPart const> part)
    : VizPartContainer(name, refId), m_part(std::move(part)) {
    if (!m_part)
        return;
    for (std::size_t i = 0; i < m_part->faces.size(); ++i)
        m_faceIndex.emplace(m_part->faces[i].entityId, i);
    for (std::size_t i = 0; i < m_part->edges.size(); ++i)
        m_edgeIndex.emplace(m_part->edges[i].entityId, i);
}

void ReferencePartContainer::ReleaseModelerData() {}

char const* ReferencePartContainer::GetModelerTypeName() const {
    return "Reference";
}

bool ReferencePartContainer::IsModelerDataValid() const {
    return m_part != nullptr;
}

bool ReferencePartContainer::HasFace(unsigned long id) const {
    return m_faceIndex.count(id) != 0;
}

bool ReferencePartContainer::HasEdge(unsigned long id) const {
    return m_edgeIndex.count(id) != 0;
}

TarvexConvertedPart::Face const* ReferencePartContainer::FindFace(unsigned long id) const {
    auto const found = m_faceIndex.find(id);
    return found == m_faceIndex.end() ? nullptr : &m_part->faces[found->second];
}

TarvexConvertedPart::Edge const* ReferencePartContainer::FindEdge(unsigned long id) const {
    auto const found = m_edgeIndex.find(id);
    return found == m_edgeIndex.end() ? nullptr : &m_part->edges[found->second];
}

VizBox ReferencePartContainer::GetBox() const {
    if (!m_part || m_part->empty)
        return VizBox();
    return VizBox(m_part->low, m_part->high);
}

} // namespace VizReferenceModeler

#include <VizBridge/contracts/kolba/VizPMICollection.h>

#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>

#include <algorithm>
#include <cstddef>
#include <memory>
#include <set>

namespace KolbaVizCore {

namespace {

// Only these element classes carry a mechanical id.
VizPort::WString mechanicalIdOf(VizElement const& element) {
    if (auto const* pmi = dynamic_cast<VizPMI const*>(&element))
        return pmi->GetMechanicalID();
    if (auto const* mesh = dynamic_cast<VizMesh const*>(&element))
        return mesh->GetMechanicalID();
    if (auto const* face = dynamic_cast<VizFace const*>(&element))
        return face->GetMechanicalID();
    if (auto const* edge = dynamic_cast<VizEdge const*>(&element))
        return edge->GetMechanicalID();
    if (auto const* collection = dynamic_cast<VizPMICollection const*>(&element))
        return collection->GetMechanicalID();
    return VizPort::WString();
}

bool isNamedBy(VizElement const& element, VizPort::WString const& key) {
    if (key.empty())
        return false;
    return mechanicalIdOf(element) == key || element.GetVisualID() == key;
}

} // namespace

void VizPMICollection::SetMemberCountHint(int count) {
    if (count > 0)
        m_members.reserve(static_cast<std::size_t>(count));
}

bool VizPMICollection::IsMember(VizElement const& element) const {
    return std::any_of(m_members.begin(), m_members.end(),
                       [&element](VizPort::WString const& key) { return isNamedBy(element, key); });
}

bool VizPMICollection::GetMemberRenderIds(RenderId*& out, int& count, bool includeOwnPath) const {
    std::vector<RenderId> paths;
    RenderId own;
    if (includeOwnPath && Get3DRenderID(own))
        paths.push_back(own);

    // The map names a summary node's element a second time: each element counts once.
    std::set<VizElement const*> taken;
    for (VizPort::WString const& key : m_members) {
        for (auto const& [entity, element] : m_entityMap) {
            if (element == nullptr || taken.count(element) != 0 || !isNamedBy(*element, key))
                continue;
            taken.insert(element);
            RenderId path;
            if (element->Get3DRenderID(path))
                paths.push_back(path);
        }
    }
    if (paths.empty())
        return false;

    // The caller owns the array and releases it with delete[].
    auto array = std::make_unique<RenderId[]>(paths.size());
    std::copy(paths.begin(), paths.end(), array.get());
    out = array.release();
    count = static_cast<int>(paths.size());
    return true;
}

} // namespace KolbaVizCore

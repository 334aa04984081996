#pragma once

#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/platform/WString.h>

#include <map>
#include <utility>
#include <vector>

namespace KolbaVizCore {

/// A named set of PMI, the common part of views and captures: a name, a mechanical id, an
/// active state, and the keys of its members. A member key names an element by its
/// mechanical id or its visual id (an annotation, a constructed geometry), or is the path of
/// a body. Its hidden state, visual id and render id are VizElement's.
///
/// Owns its member keys and a copy of the entity map it was given; the elements that map
/// points at belong to their container and must outlive the collection's use of the map.
class VizPMICollection : public VizElement {
public:
    using EntityMap = std::map<EntityId, VizElement const*>;

    VizPMICollection() = default;
    VizPMICollection(VizPMICollection const&) = default;
    VizPMICollection& operator=(VizPMICollection const&) = default;

    /// The outline of the collection's plane as a closed line: five points, 15 floats, the
    /// last point equal to the first. Null when the collection has no plane.
    virtual float const* GetPlaneRectangle() const { return nullptr; }

    void SetName(VizPort::WString const& name) { m_name = name; }
    VizPort::WString GetName() const { return m_name; }
    void SetMechanicalID(VizPort::WString const& id) { m_mechanicalId = id; }
    VizPort::WString GetMechanicalID() const { return m_mechanicalId; }

    /// Starts false.
    void SetActive(bool active) { m_active = active; }
    bool GetActive() const { return m_active; }

    /// How many members will be added; a negative count is ignored.
    void SetMemberCountHint(int count);
    /// Appends a member key. Keys are kept as given, doubles and empty keys included.
    void AddMember(VizPort::WString member) { m_members.push_back(std::move(member)); }
    std::vector<VizPort::WString> const& GetMembers() const { return m_members; }

    /// Keeps a copy of `map`, the rendered elements among which members are looked up.
    void SetEntityMap(EntityMap const& map) { m_entityMap = map; }
    EntityMap const& GetEntityMap() const { return m_entityMap; }

    /// Whether a member key is the element's mechanical id or its visual id. Empty ids
    /// match nothing.
    bool IsMember(VizElement const& element) const;

    /// The render ids of the members found in the entity map, each element once, in the
    /// order of the member keys, and among the elements of one key in the map's order.
    /// Members that were not rendered have no path and are left out. With `includeOwnPath`
    /// the collection's own render id, if it has one, comes first.
    /// True, and in `out` a new array of `count` paths, if there is at least one path: the
    /// array crosses to the caller, who releases it with delete[]. Otherwise false, and both
    /// arguments untouched.
    bool GetMemberRenderIds(RenderId*& out, int& count, bool includeOwnPath) const;

private:
    VizPort::WString m_name;
    VizPort::WString m_mechanicalId;
    bool m_active = false;
    std::vector<VizPort::WString> m_members;
    EntityMap m_entityMap;
};

} // namespace KolbaVizCore

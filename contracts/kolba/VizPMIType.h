#pragma once

#include <VizBridge/contracts/kolba/EntityType.h>

#include <string>

namespace KolbaVizCore {

/// What kind of PMI a PMI object or a group of them is: its type number, a narrow name for
/// the scene, and the entity type that tags its scene node. A plain value.
class VizPMIType {
public:
    /// The PMI type numbers. Within a group the numbers run in step with the import
    /// library's node types; only the bounds of each group are named here.
    enum ID : int {
        UndefinedPMI = 0, ///< no known type; also every group-less PMI's group
        GenericPMI = 1,   ///< a PMI of no particular kind
        FirstNote = 2,
        LastNote = 5,
        FirstDatum = 6,
        LastDatum = 9,
        FirstDimension = 10,
        LastDimension = 22,
        FirstGeomTol = 23,
        LastGeomTol = 45,
        FirstRoughness = 46,
        LastRoughness = 47,
    };

    /// Copies `name`; a null name counts as an empty one.
    VizPMIType(ID const& id, char const* name, EntityType const& entityType);

    ID GetID() const { return m_id; }
    std::string GetName() const { return m_name; }
    EntityType GetEntityType() const { return m_entityType; }

    bool operator==(VizPMIType const& other) const {
        return m_id == other.m_id && m_name == other.m_name && m_entityType == other.m_entityType;
    }
    bool operator!=(VizPMIType const& other) const { return !(*this == other); }

private:
    ID m_id;
    std::string m_name;
    EntityType m_entityType;
};

} // namespace KolbaVizCore

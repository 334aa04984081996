#pragma once

#include <VizBridge/contracts/kolba/EntityType.h>

#include <cstdint>
#include <tuple>

namespace KolbaVizCore {

/// Names an entity as the application knows it: id, parent id and type, plus one word
/// that is kept for the library and takes part in no comparison.
class EntityId {
public:
    /// A default id has the type word 0xFFFFFFFF: it names nothing.
    EntityId() = default;
    EntityId(std::uint32_t parentId, std::uint32_t type, std::uint32_t id)
        : m_id(id), m_parentId(parentId), m_type(type) {}

    std::uint32_t GetId() const { return m_id; }
    std::uint32_t GetParentId() const { return m_parentId; }
    std::uint32_t GetType() const { return m_type; }
    void SetId(std::uint32_t id) { m_id = id; }
    void SetParentId(std::uint32_t parentId) { m_parentId = parentId; }
    void SetType(std::uint32_t type) { m_type = type; }

    bool IsValid() const { return m_type != 0xFFFFFFFFu; }
    /// True for the PMI kinds: PMI and UnknownPMI up to Roughness.
    bool IsAnnotation() const {
        return m_type == PMI || (m_type >= UnknownPMI && m_type <= Roughness);
    }

    /// The kind a number names: a named EntityType value is itself; any other number, which
    /// can only come from a group tag of PMI that the library does not know, is UnknownPMI.
    static EntityType GetTypeFromInt(std::uint32_t value) {
        switch (value) {
        case Vertex:
        case Edge:
        case Face:
        case Body:
        case Cloud:
        case PMI:
        case Vis:
        case Group:
        case Link:
        case Text:
        case Views:
        case Captures:
        case UnknownPMI:
        case Note:
        case Datum:
        case Dimension:
        case GeomTol:
        case Roughness:
        case FTAGeometry:
            return static_cast<EntityType>(value);
        default:
            return UnknownPMI;
        }
    }

    /// Orders by id, then parent id, then type.
    bool operator<(EntityId const& other) const {
        return std::tie(m_id, m_parentId, m_type) <
               std::tie(other.m_id, other.m_parentId, other.m_type);
    }
    bool operator==(EntityId const& other) const {
        return m_id == other.m_id && m_parentId == other.m_parentId && m_type == other.m_type;
    }
    bool operator!=(EntityId const& other) const { return !(*this == other); }

private:
    std::uint32_t m_id = 0;
    std::uint32_t m_parentId = 0;
    std::uint32_t m_type = 0xFFFFFFFFu;
    [[maybe_unused]] std::uint32_t m_reserved = 0; // keeps the interface's 16-byte layout
};

} // namespace KolbaVizCore

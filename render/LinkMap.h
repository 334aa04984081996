#pragma once

#include <VizBridge/model/VizTypes.h>

#include <cstdint>
#include <utility>
#include <vector>

namespace VizBridgeTarvex {

/// The records of a rendered product's nodes: for each key (an EntityId, ordered as EntityId
/// orders) the path of the node it names. The walk over the instances adds them; the first
/// path added under a key stays.
///
/// The id conversions ask three questions of it, each defined as a walk over the records in
/// key order: the path of a key, the first record whose key has a given id, and the record
/// with the longest path that begins a picked path (the first in key order among equals).
/// A viewer asks them on every mouse move over scenes of 100 000 instances, so they are
/// answered from sorted tables in logarithmic time, with the walk's answers, ties included.
///
/// Stored flat, since an instance costs a record or two: records sorted by key, each
/// pointing into one pool where every path is stored once, and the paths sorted by their
/// tags. Finish sorts after the walk; until then a query sees nothing of what was added.
/// Owns all of it.
class LinkMap {
public:
    /// Records `path` under `key`; a path equal to the one added just before is stored
    /// once (an instance that is a part adds its path under two keys).
    void Add(EntityId const& key, RenderId const& path);
    /// Sorts what was added since the last Finish in with the rest, drops every later
    /// record of a key, and gives back the memory the walk left unused.
    void Finish();
    void Clear();

    bool IsEmpty() const { return m_records.empty(); }
    /// Records a query sees, one per key.
    std::size_t Size() const { return m_finished; }

    /// The path recorded under `key`.
    bool Find(EntityId const& key, RenderId& path) const;
    /// The first record in key order whose key has the id `id`, whatever its parent id and
    /// type.
    bool FindFirstWithId(std::uint32_t id, EntityId& key, RenderId& path) const;
    /// The record whose path begins `id` (same leading word, its tags the first tags of
    /// `id`) and is the longest of those; among equal paths the first in key order.
    bool FindLongestPrefix(RenderId const& id, EntityId& key, RenderId& path) const;

    /// Every record a query sees, in key order.
    std::vector<std::pair<EntityId, RenderId>> Records() const;
    /// Heap bytes held by the tables.
    std::size_t HeapBytes() const;

private:
    struct Record {
        std::uint32_t id;
        std::uint32_t parentId;
        std::uint32_t type;
        std::uint32_t path; ///< offset of the path in m_pool
    };
    /// A path, and the first record in key order that points at it.
    struct PathRecord {
        std::uint32_t path;
        std::uint32_t record;
    };

    static bool keyLess(Record const& a, Record const& b);
    EntityId keyOf(Record const& record) const;
    RenderId pathAt(std::uint32_t offset) const;
    /// Orders paths by leading word, length and tags; any total order serves the exact
    /// lookups of FindLongestPrefix.
    int comparePaths(std::uint32_t offset, std::uint32_t leading, std::uint32_t const* tags,
                     std::uint32_t length) const;
    bool fill(Record const& record, EntityId& key, RenderId& path) const;

    std::vector<Record> m_records;          ///< sorted by key up to m_finished, then as added
    std::vector<std::uint32_t> m_pool;      ///< per path: leading word, length, tags
    std::vector<PathRecord> m_paths;        ///< sorted by path
    std::uint32_t m_lastPath = 0xFFFFFFFFu; ///< offset of the path added last
    std::uint32_t m_longestPath = 0;
    std::size_t m_finished = 0; ///< records sorted in and seen by queries
};

} // namespace VizBridgeTarvex

#include <VizBridge/render/LinkMap.h>

#include <algorithm>
#include <tuple>

namespace VizBridgeTarvex {

namespace {

constexpr std::uint32_t kNoPath = 0xFFFFFFFFu;
/// Words in front of a path's tags in the pool: leading word, length.
constexpr std::uint32_t kPathHeader = 2;

} // namespace

void LinkMap::Add(EntityId const& key, RenderId const& path) {
    auto const length = static_cast<std::uint32_t>(path.Length());
    bool const same = m_lastPath != kNoPath && comparePaths(m_lastPath, path.GetLeading(),
                                                            path.GetTags().data(), length) == 0;
    if (!same) {
        m_lastPath = static_cast<std::uint32_t>(m_pool.size());
        m_pool.push_back(path.GetLeading());
        m_pool.push_back(length);
        m_pool.insert(m_pool.end(), path.GetTags().begin(), path.GetTags().end());
    }
    m_records.push_back(Record{key.GetId(), key.GetParentId(), key.GetType(), m_lastPath});
}

void LinkMap::Finish() {
    // Stable, so that of the records of one key the one added first comes first and stays.
    std::stable_sort(m_records.begin(), m_records.end(), keyLess);
    m_records.erase(std::unique(m_records.begin(), m_records.end(),
                                [](Record const& a, Record const& b) {
                                    return !keyLess(a, b) && !keyLess(b, a);
                                }),
                    m_records.end());

    // Every path a record points at, sorted by its tags and, among equal paths, by the
    // record's place in key order: the first of each run answers for that path.
    std::vector<PathRecord> paths;
    paths.reserve(m_records.size());
    for (std::size_t index = 0; index < m_records.size(); ++index)
        paths.push_back(PathRecord{m_records[index].path, static_cast<std::uint32_t>(index)});
    std::sort(paths.begin(), paths.end(), [this](PathRecord const& a, PathRecord const& b) {
        int const order = comparePaths(a.path, m_pool[b.path], m_pool.data() + b.path + kPathHeader,
                                       m_pool[b.path + 1]);
        return order != 0 ? order < 0 : a.record < b.record;
    });

    // One copy of each path in a new pool, which leaves out the paths that only dropped
    // records pointed at.
    std::vector<std::uint32_t> pool;
    std::vector<std::uint32_t> moved(m_pool.size(), kNoPath);
    m_paths.clear();
    m_longestPath = 0;
    for (std::size_t index = 0; index < paths.size(); ++index) {
        std::uint32_t const old = paths[index].path;
        bool const first =
            index == 0 || comparePaths(paths[index - 1].path, m_pool[old],
                                       m_pool.data() + old + kPathHeader, m_pool[old + 1]) != 0;
        if (first) {
            auto const offset = static_cast<std::uint32_t>(pool.size());
            std::uint32_t const length = m_pool[old + 1];
            pool.insert(pool.end(), m_pool.begin() + old,
                        m_pool.begin() + old + kPathHeader + length);
            m_paths.push_back(PathRecord{offset, paths[index].record});
            m_longestPath = std::max(m_longestPath, length);
        }
        moved[old] = m_paths.back().path;
    }
    for (Record& record : m_records)
        record.path = moved[record.path];

    m_pool = std::move(pool);
    m_pool.shrink_to_fit();
    m_records.shrink_to_fit();
    m_paths.shrink_to_fit();
    m_lastPath = kNoPath;
    m_finished = m_records.size();
}

void LinkMap::Clear() {
    // Swapped with empty tables, so that the memory goes too.
    std::vector<Record>().swap(m_records);
    std::vector<std::uint32_t>().swap(m_pool);
    std::vector<PathRecord>().swap(m_paths);
    m_lastPath = kNoPath;
    m_longestPath = 0;
    m_finished = 0;
}

bool LinkMap::Find(EntityId const& key, RenderId& path) const {
    Record const wanted{key.GetId(), key.GetParentId(), key.GetType(), 0};
    auto const end = m_records.begin() + static_cast<std::ptrdiff_t>(m_finished);
    auto const found = std::lower_bound(m_records.begin(), end, wanted, keyLess);
    if (found == end || keyLess(wanted, *found))
        return false;
    path = pathAt(found->path);
    return true;
}

bool LinkMap::FindFirstWithId(std::uint32_t id, EntityId& key, RenderId& path) const {
    auto const end = m_records.begin() + static_cast<std::ptrdiff_t>(m_finished);
    auto const found = std::lower_bound(
        m_records.begin(), end, id,
        [](Record const& record, std::uint32_t wanted) { return record.id < wanted; });
    if (found == end || found->id != id)
        return false;
    return fill(*found, key, path);
}

bool LinkMap::FindLongestPrefix(RenderId const& id, EntityId& key, RenderId& path) const {
    if (m_paths.empty())
        return false;
    std::uint32_t const* const tags = id.GetTags().data();
    auto const longest = std::min(static_cast<std::uint32_t>(id.Length()), m_longestPath);
    // From the longest candidate down: the first head of `id` that is a recorded path wins.
    for (std::uint32_t length = longest + 1; length-- > 0;) {
        auto const found =
            std::lower_bound(m_paths.begin(), m_paths.end(), length,
                             [&](PathRecord const& entry, std::uint32_t wanted) {
                                 return comparePaths(entry.path, id.GetLeading(), tags, wanted) < 0;
                             });
        if (found != m_paths.end() && comparePaths(found->path, id.GetLeading(), tags, length) == 0)
            return fill(m_records[found->record], key, path);
    }
    return false;
}

std::vector<std::pair<EntityId, RenderId>> LinkMap::Records() const {
    std::vector<std::pair<EntityId, RenderId>> records;
    records.reserve(m_finished);
    for (std::size_t index = 0; index < m_finished; ++index)
        records.emplace_back(keyOf(m_records[index]), pathAt(m_records[index].path));
    return records;
}

std::size_t LinkMap::HeapBytes() const {
    return m_records.capacity() * sizeof(Record) + m_pool.capacity() * sizeof(std::uint32_t) +
           m_paths.capacity() * sizeof(PathRecord);
}

bool LinkMap::keyLess(Record const& a, Record const& b) {
    // The order of EntityId: id, then parent id, then type.
    return std::tie(a.id, a.parentId, a.type) < std::tie(b.id, b.parentId, b.type);
}

EntityId LinkMap::keyOf(Record const& record) const {
    return EntityId(record.parentId, record.type, record.id);
}

RenderId LinkMap::pathAt(std::uint32_t offset) const {
    RenderId path(m_pool[offset]);
    std::uint32_t const length = m_pool[offset + 1];
    for (std::uint32_t index = 0; index < length; ++index)
        path.AddValue(m_pool[offset + kPathHeader + index]);
    return path;
}

int LinkMap::comparePaths(std::uint32_t offset, std::uint32_t leading, std::uint32_t const* tags,
                          std::uint32_t length) const {
    auto const order = [](std::uint32_t a, std::uint32_t b) { return a < b ? -1 : a > b ? 1 : 0; };
    if (int const byLeading = order(m_pool[offset], leading))
        return byLeading;
    std::uint32_t const ownLength = m_pool[offset + 1];
    if (int const byLength = order(ownLength, length))
        return byLength;
    std::uint32_t const* const own = m_pool.data() + offset + kPathHeader;
    for (std::uint32_t index = 0; index < length; ++index) {
        if (int const byTag = order(own[index], tags[index]))
            return byTag;
    }
    return 0;
}

bool LinkMap::fill(Record const& record, EntityId& key, RenderId& path) const {
    key = keyOf(record);
    path = pathAt(record.path);
    return true;
}

} // namespace VizBridgeTarvex

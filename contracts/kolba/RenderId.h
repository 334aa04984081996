#pragma once

#include <algorithm>
#include <cstdint>
#include <vector>

namespace KolbaVizCore {

/// A path through the scene: a leading word and the sequence of tags from the top down.
class RenderId {
public:
    RenderId() = default;
    explicit RenderId(std::uint32_t leading) : m_leading(leading) {}

    int Length() const { return static_cast<int>(m_tags.size()); }
    std::uint32_t& operator[](int index) { return m_tags[static_cast<std::size_t>(index)]; }
    std::uint32_t const& operator[](int index) const {
        return m_tags[static_cast<std::size_t>(index)];
    }
    void AddValue(std::uint32_t tag) { m_tags.push_back(tag); }
    /// Cuts or pads (with 0) the path to `length` tags.
    void SetLength(int length) {
        m_tags.resize(length < 0 ? 0u : static_cast<std::size_t>(length));
    }
    bool IsEmpty() const { return m_tags.empty(); }
    void Clear() { m_tags.clear(); }

    std::uint32_t GetLeading() const { return m_leading; }
    void SetLeading(std::uint32_t leading) { m_leading = leading; }
    std::vector<std::uint32_t> const& GetTags() const { return m_tags; }

    /// The same leading word and the same tags.
    bool operator==(RenderId const& other) const = default;
    /// Whether this path runs through `prefix`: the same leading word, and `prefix`'s tags
    /// begin this path's. A path begins with itself.
    bool BeginsWith(RenderId const& prefix) const {
        return m_leading == prefix.m_leading && prefix.m_tags.size() <= m_tags.size() &&
               std::equal(prefix.m_tags.begin(), prefix.m_tags.end(), m_tags.begin());
    }

private:
    std::uint32_t m_leading = 0;
    std::vector<std::uint32_t> m_tags;
};

} // namespace KolbaVizCore

#pragma once

#include <cstddef>
#include <memory>
#include <vector>

namespace KolbaVizCore {

/// The children of a container or parent element: a sequence of pointers in the order they
/// were added, each owned by the sequence and deleted with it. The pointers cross the
/// element interfaces raw, so the sequence is kept as raw pointers too, and readers get it
/// as `std::vector<T*> const&`. Null is never stored. Cannot be copied.
template <class T> class OwnedPointers {
public:
    OwnedPointers() = default;
    OwnedPointers(OwnedPointers const&) = delete;
    OwnedPointers& operator=(OwnedPointers const&) = delete;
    ~OwnedPointers() { Clear(); }

    /// Takes over `item`; null is ignored. An item must be added once only.
    void Add(T* item) {
        std::unique_ptr<T> owned(item);
        if (!owned)
            return;
        m_items.push_back(owned.get()); // may throw: `owned` still frees the item then
        static_cast<void>(owned.release());
    }
    /// Room for `count` items in all, so that adding them does not reallocate.
    void Reserve(std::size_t count) { m_items.reserve(count); }
    std::vector<T*> const& Get() const { return m_items; }
    std::size_t Size() const { return m_items.size(); }
    void Clear() {
        for (T* item : m_items)
            std::unique_ptr<T> const released(item); // the sequence owns its items
        m_items.clear();
    }

private:
    std::vector<T*> m_items; ///< owned
};

} // namespace KolbaVizCore

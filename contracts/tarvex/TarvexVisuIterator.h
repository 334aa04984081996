#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>
#include <utility>
#include <vector>

/// The working that the iterators over visualisation data share: Next() is called before the
/// first Current(); Current() before Next() or past the end gives an empty item. Internal to
/// the library.
///
/// `Derived` is the iterator class. It names the operations that its calls ask the fault plan
/// about (kGetCount, kNext, kCurrent), and may make its items itself with a static
/// MakeItem(context, record). Shares ownership of the list it walks, which belongs to the
/// import or build it came from.
template <class Derived, class Item, class Record> class TarvexVisuIterator {
public:
    TarvexVisuIterator() = default;
    TarvexVisuIterator(TarvexVisuContext context,
                       std::shared_ptr<std::vector<Record> const> records)
        : m_context(std::move(context)), m_records(std::move(records)) {}

    int GetCount() const {
        m_context.Check(Derived::kGetCount);
        return size();
    }

    bool Next() {
        m_context.Check(Derived::kNext);
        // Stops one past the last item, so that further calls keep answering false.
        if (m_position < size()) {
            ++m_position;
        }
        return m_position < size();
    }

    Item Current() const {
        m_context.Check(Derived::kCurrent);
        if (m_position < 0 || m_position >= size()) {
            return Item();
        }
        // The item shares the whole list, so it stays valid after the iterator is gone.
        std::shared_ptr<Record const> record(m_records,
                                             &(*m_records)[static_cast<std::size_t>(m_position)]);
        return Derived::MakeItem(m_context, std::move(record));
    }

    /// Makes an item that reads `record`; iterators whose items are made otherwise hide it.
    static Item MakeItem(TarvexVisuContext const& context, std::shared_ptr<Record const> record) {
        return Item(context, std::move(record));
    }

private:
    int size() const { return m_records ? static_cast<int>(m_records->size()) : 0; }

    TarvexVisuContext m_context;
    std::shared_ptr<std::vector<Record> const> m_records;
    int m_position = -1;
};

#include <VizBridge/import/VisuIdMapJournal.h>

namespace VizBridgeTarvex {

VisuIdMapJournal::~VisuIdMapJournal() {
    for (auto const& [key, before] : m_journal) {
        if (before)
            m_map[key] = *before;
        else
            m_map.erase(key);
    }
}

void VisuIdMapJournal::Set(WString const& key, VizElement* element) {
    auto const found = m_map.find(key);
    // Only the first write of a walk tells what the key held before it.
    m_journal.try_emplace(key, found == m_map.end() ? std::nullopt
                                                    : std::optional<VizElement*>(found->second));
    m_map[key] = element;
}

void VisuIdMapJournal::Merge(Map const& entries) {
    for (auto const& [key, element] : entries)
        Set(key, element);
}

} // namespace VizBridgeTarvex

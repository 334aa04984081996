#pragma once

#include <VizBridge/model/VizTypes.h>

#include <map>
#include <optional>

namespace VizBridgeTarvex {

/// Writes into the builder's visual id map on behalf of one container walk, and remembers
/// what each key held before. Unless the walk commits, the destructor puts every key back,
/// so that a walk that an exception ended, and whose containers are freed, leaves no entry
/// pointing at a freed element.
///
/// Points at the map, which must outlive it; owns only its journal.
class VisuIdMapJournal {
public:
    using Map = std::map<WString, VizElement*>;

    explicit VisuIdMapJournal(Map& map) : m_map(map) {}
    VisuIdMapJournal(VisuIdMapJournal const&) = delete;
    VisuIdMapJournal& operator=(VisuIdMapJournal const&) = delete;
    ~VisuIdMapJournal();

    /// Enters `element` under `key`, replacing what stood there.
    void Set(WString const& key, VizElement* element);
    /// Enters every entry of `entries`, each replacing what stood under its key.
    void Merge(Map const& entries);
    /// Keeps what was written.
    void Commit() { m_journal.clear(); }

private:
    Map& m_map; ///< not owned
    /// Per key written, its first earlier value; nullopt when the key was absent.
    std::map<WString, std::optional<VizElement*>> m_journal;
};

} // namespace VizBridgeTarvex

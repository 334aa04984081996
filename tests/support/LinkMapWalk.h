#pragma once

// The questions that LinkMap answers, asked as walks over a std::map in key order: the
// reference its answers must equal, for the tests and the benchmarks.

#include <VizBridge/model/VizTypes.h>

#include <map>

namespace VizBridgeTest {

using VizBridgeTarvex::EntityId;
using VizBridgeTarvex::RenderId;

using Records = std::map<EntityId, RenderId>;

struct Answer {
    bool found = false;
    EntityId key;
    RenderId path;
    bool operator==(Answer const&) const = default;
};

inline Answer walkFirstWithId(Records const& records, std::uint32_t id) {
    for (auto const& [key, path] : records)
        if (key.GetId() == id)
            return {true, key, path};
    return {};
}

inline Answer walkLongestPrefix(Records const& records, RenderId const& id) {
    Answer best;
    for (auto const& [key, path] : records) {
        RenderId head = id;
        if (head.Length() > path.Length())
            head.SetLength(path.Length());
        if (head == path && (!best.found || path.Length() > best.path.Length()))
            best = {true, key, path};
    }
    return best;
}

} // namespace VizBridgeTest

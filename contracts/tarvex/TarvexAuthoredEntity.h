#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <optional>
#include <vector>

/// An entity as a host or test describes it: reached from the product through instances
/// (their authoring ids, top first), ending in an entity of a part. An empty path: the entity
/// lies in the part itself.
struct TarvexAuthoredEntity {
    std::vector<unsigned int> instancePath;
    unsigned int entityId = 0; ///< its face or edge id in the part
    /// The visual id of what shows it in the part's visualisation data.
    std::optional<VizPort::WString> visualId;
    /// False: the end of the path is no entity of a part, so that the entity is neither a
    /// part entity nor, at the end of its path, an instance entity.
    bool endsInPart = true;
};

#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredPartGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuData.h>

#include <optional>
#include <vector>

/// A reference (part or sub-assembly) as a host or test describes it. Absent texts make
/// the matching getters give no text.
struct TarvexAuthoredReference {
    unsigned int uniqueId = 0;
    bool isPart = true;
    std::optional<VizPort::WString> name;        ///< GetReferenceName
    std::optional<VizPort::WString> storageName; ///< GetStorageName
    /// Authoring ids of the instances below this reference, in order. Filled by
    /// TarvexModel::AddInstance.
    std::vector<unsigned int> instances;
    /// The part document's geometry; read only for parts.
    TarvexAuthoredPartGeometry geometry;
    /// The visualisation data of the reference's document, which
    /// TarvexVisualizationImporter reads.
    TarvexAuthoredVisuData visu;
};

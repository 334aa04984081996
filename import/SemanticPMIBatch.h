#pragma once

#include <VizBridge/model/SemanticPMIMaps.h>

namespace VizBridgeTarvex {

/// Owns the semantic records of one import step until they are handed to the product
/// structure. Whatever is still here when it goes (records never handed over, or an import
/// that an exception ended) is freed with it.
class SemanticPMIBatch {
public:
    SemanticPMIBatch() = default;
    SemanticPMIBatch(SemanticPMIBatch const&) = delete;
    SemanticPMIBatch& operator=(SemanticPMIBatch const&) = delete;
    ~SemanticPMIBatch();

    SemanticPMIByReference& map() { return m_map; }
    bool empty() const { return m_map.empty(); }

private:
    SemanticPMIByReference m_map; ///< owns the inner maps and their records
};

} // namespace VizBridgeTarvex

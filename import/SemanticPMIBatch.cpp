#include <VizBridge/import/SemanticPMIBatch.h>

namespace VizBridgeTarvex {

SemanticPMIBatch::~SemanticPMIBatch() {
    for (auto& [id, records] : m_map) {
        if (!records)
            continue;
        for (auto& [key, record] : *records)
            delete record; // never handed over
        delete records;
    }
}

} // namespace VizBridgeTarvex

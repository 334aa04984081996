#pragma once

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>

#include <memory>

namespace VizBridgeTarvex {

/// Runs the assembly form of MakeVizProductStructure on `model`. `out` receives the
/// structure even when the call throws, so a test can look at what was built.
inline void buildStructure(TarvexModel const& model, std::unique_ptr<VizProductStructure>& out) {
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();
    VizProductStructure* raw = nullptr;
    try {
        VizBuilder::MakeVizProductStructure(result, input, document, raw);
    } catch (...) {
        out.reset(raw);
        throw;
    }
    out.reset(raw);
}

inline std::unique_ptr<VizProductStructure> buildStructure(TarvexModel const& model) {
    std::unique_ptr<VizProductStructure> out;
    buildStructure(model, out);
    return out;
}

} // namespace VizBridgeTarvex

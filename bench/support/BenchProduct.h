#pragma once
// What the render benchmarks share: a product imported from an authored model the way a
// host imports tessellated data, and an empty scene to draw it into.
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>

#include <memory>

namespace VizBridgeBench {

/// The structure of `model` with every part's tessellated data imported, and its PMI too
/// when `pmi` is set.
inline std::unique_ptr<VizBridgeTarvex::VizProductStructure>
ImportTessellated(TarvexModel const& model, bool pmi) {
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();
    std::unique_ptr<VizBridgeTarvex::VizProductStructure> structure =
        VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);
    VizBridgeTarvex::VizBuilder builder(*structure, input, nullptr);
    builder.SetImportVisu(true);
    builder.SetImportPMI(pmi);
    builder.ImportAndBuildPS();
    return structure;
}

/// A builder with the default item factory and no view.
inline std::unique_ptr<KolbaVizCore::SceneBuilder> MakeScene() {
    auto builder = std::make_unique<KolbaVizCore::SceneBuilder>();
    builder->SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    return builder;
}

} // namespace VizBridgeBench

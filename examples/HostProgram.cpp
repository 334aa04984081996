// vizbridge_host: the smallest complete host. It describes a two-part assembly in the import
// library's model, builds the product structure, imports each part's BREP through the
// reference modeler, draws the structure into a scene and prints what it got.
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/render/UniqueRenderer.h>

#include <iostream>
#include <memory>

namespace {

/// A square plate of `size` in the plane z = 0: one face of two triangles, entity id 1.
/// Triangles index vertices (vertex k is the floats 3k to 3k + 2).
TarvexAuthoredPartGeometry Plate(float size) {
    TarvexAuthoredPartGeometry plate;
    plate.faces.push_back(
        {1, {0, 0, 0, size, 0, 0, size, size, 0, 0, size, 0}, {0, 1, 2, 0, 2, 3}});
    return plate;
}

} // namespace

int main() {
    // 1. The assembly, as the import library gives it. A real host gets this from a CAD
    //    file; here it is authored in memory. Reference ids are the import library's unique
    //    ids: every instance of a reference shares its id, and the structure files the
    //    reference's containers under it.
    TarvexModel model;
    model.SetProductName(u"Hinge");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    model.AddPart(1, u"Leaf").geometry = Plate(40.0f);
    model.AddPart(2, u"Pin").geometry = Plate(5.0f);
    model.AddRootInstance(1, u"Leaf.1");
    TarvexPlacement moved;
    moved.translation[0] = 80.0; // the second leaf, 80 mm along x
    model.AddRootInstance(1, u"Leaf.2").placement = moved;
    model.AddRootInstance(2, u"Pin.1");

    // 2. Import in the caller's process (0 would spread the BREP conversion over every
    //    processor of the machine through the import library's spooler).
    TarvexMultiProcess::SetNumberOfProcessorsToUse(1);
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();
    std::unique_ptr<VizBridgeTarvex::VizProductStructure> structure =
        VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);

    // BREP never passes through VizBridge: a modeler imports and draws it. The host keeps the
    // modeler alive as long as the builder and the renderer use it.
    VizReferenceModeler::ReferenceModelerServices modeler;
    {
        VizBridgeTarvex::VizBuilder builder(*structure, input, nullptr);
        builder.SetModelerServices(&modeler);
        builder.ImportAndBuildPS(); // always true: failures become texts in the structure
    }
    std::cout << VizPort::Narrow(structure->ToString());
    for (VizPort::WString const& message : structure->GetErrorMessages())
        std::cout << "error: " << VizPort::Narrow(message) << '\n';

    // 3. Draw: the first instance of a reference draws it, the second one refers to that.
    KolbaVizCore::SceneBuilder scene;
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    std::unique_ptr<VizBridgeTarvex::TarvexRenderer> renderer =
        VizBridgeTarvex::MakeUniqueRenderer(structure.get(), &modeler, &scene);
    bool const rendered = renderer->Render();
    std::cout << (rendered ? "rendered " : "not rendered ") << scene.GetNodeCount()
              << " scene nodes\n";

    // 4. In this order: the renderer (it removes its nodes from the scene), then the scene
    //    and the structure.
    renderer.reset();
    return rendered && structure->GetNumberOfVizPartContainers() == 2 ? 0 : 1;
}

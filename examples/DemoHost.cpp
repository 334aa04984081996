// vizbridge_demo: a host that imports the bundled sample assembly and prints what VizBridge
// made of it. Each step of the road is one function below.

#include "examples/ContainerReport.h"
#include "examples/SampleAssembly.h"

#include "contracts/kolba/DefaultGeometryItemFactory.h"
#include "contracts/kolba/RecordingView3D.h"
#include "contracts/kolba/SceneBuilder.h"
#include "contracts/kolba/View3DAdapter.h"
#include "contracts/platform/DebugOutput.h"
#include "contracts/platform/WString.h"
#include "contracts/tarvex/TarvexDocument.h"
#include "contracts/tarvex/TarvexInputProductStructure.h"
#include "contracts/tarvex/TarvexMultiProcess.h"
#include "contracts/tarvex/TarvexPSImportResult.h"
#include "examples/ReferenceModeler/ReferenceModelerServices.h"
#include "import/VizBuilder.h"
#include "model/VizProductStructure.h"
#include "render/TarvexRenderer.h"

#include <exception>
#include <iostream>
#include <memory>

namespace {

using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;
using VizPort::Narrow;

/// The import's progress callback: called synchronously on the importing thread, with a
/// null text at the first and the last call.
void PrintProgress(int const& current, int const& total, char16_t const* text) {
    std::cout << "  progress " << current << '/' << total;
    if (text != nullptr)
        std::cout << ": " << Narrow(text);
    std::cout << '\n';
}

/// VizBridge's debug output is silent until a host gives it a sink.
void PrintDebugText(char16_t const* text) {
    std::cerr << "  [debug] " << Narrow(text) << '\n';
}

/// Step 1: the structure, its document strings, missing files and instance tree.
/// MakeVizProductStructure hands the structure over; from here on the host owns it.
std::unique_ptr<VizProductStructure> MakeStructure(TarvexModel const& model,
                                                   TarvexInputProductStructure const& input) {
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexDocument document = model.GetDocument();
    VizProductStructure* structure = nullptr;
    try {
        VizBuilder::MakeVizProductStructure(result, input, document, structure);
    } catch (...) {
        // Only with KolbaVizCore's throw switch on: what was built is already the host's.
        delete structure;
        throw;
    }
    return std::unique_ptr<VizProductStructure>(structure);
}

struct ImportTimes {
    double brep = 0.0;
    double geometry = 0.0;
    double semanticPMI = 0.0;
    int processors = 1;
};

/// Step 2: a builder on the structure imports the data behind the tree, each part through
/// the host's modeler. The builder only points at the structure, the input and the modeler,
/// and may go as soon as the import has returned; the host keeps the modeler.
ImportTimes ImportData(VizProductStructure& structure, TarvexInputProductStructure const& input,
                       VizBridgeTarvex::VizModelerServices& modeler) {
    VizBuilder builder(structure, input, nullptr); // no import policy
    builder.SetModelerServices(&modeler);
    builder.SetProgressCallback(&PrintProgress);
    builder.ImportAndBuildPS(); // always true: failures go to GetErrorMessages
    return {builder.GetTotalImportBrepTime(), builder.GetTotalImportGeomTime(),
            builder.GetTotalImportSemanticPMITime(), builder.GetNumberOfProcessorsUsed()};
}

/// Step 2, the other road: the parts' tessellated data and graphical PMI instead of their
/// BREP. Each part that has such data gets a VizContainer of meshes, wires and point sets and
/// a VizPMIContainer of PMI, views and captures. No modeler is needed.
void ImportVisualisation(VizProductStructure& structure, TarvexInputProductStructure const& input) {
    VizBuilder builder(structure, input, nullptr);
    builder.SetImportVisu(true);
    builder.SetImportPMI(true);
    builder.SetProgressCallback(&PrintProgress);
    builder.ImportAndBuildPS();
}

void PrintTree(VizProductStructure const& structure) {
    std::cout << Narrow(structure.ToString()) << '\n';
}

void PrintDocument(VizProductStructure const& structure) {
    struct Field {
        char const* label;
        VizPort::WString (VizProductStructure::*get)() const;
    };
    static constexpr Field fields[] = {
        {"Product name", &VizProductStructure::GetProductName},
        {"Format type", &VizProductStructure::GetFormatType},
        {"Author", &VizProductStructure::GetAuthor},
        {"Organization", &VizProductStructure::GetOrganization},
        {"Version", &VizProductStructure::GetVersion},
        {"Document units", &VizProductStructure::GetDocumentUnits},
        {"Source system", &VizProductStructure::GetSourceSystem},
        {"Comment", &VizProductStructure::GetComment},
        {"File name", &VizProductStructure::GetFileName},
        {"Configuration", &VizProductStructure::GetConfigurationName},
        {"Units", &VizProductStructure::GetUnits},
    };
    for (Field const& field : fields)
        std::cout << "  " << field.label << ": " << Narrow((structure.*field.get)()) << '\n';
}

/// Step 3: failures never show in a result; the structure keeps them as texts.
void PrintFailures(VizProductStructure const& structure) {
    std::cout << "Missing files:\n";
    for (VizPort::WString const& file : structure.GetMissingFiles())
        std::cout << "  " << Narrow(file) << '\n';
    std::cout << "Error messages:\n";
    for (VizPort::WString const& message : structure.GetErrorMessages())
        std::cout << "  " << Narrow(message) << '\n';
}

void PrintTimes(ImportTimes const& times) {
    std::cout << "Import times (s): BREP " << times.brep << ", geometry " << times.geometry
              << ", semantic PMI " << times.semanticPMI << '\n'
              << "Processors used: " << times.processors << '\n';
}

/// The render's progress callback: called on the rendering thread, phase as a narrow text.
void PrintRenderProgress(int const& done, int const& total, char const* phase) {
    std::cout << "  render " << phase << ' ' << done << '/' << total << '\n';
}

/// Step 4: a renderer draws the structure into the host's scene. The host keeps the scene
/// builder, the view and the modeler (if any) alive for as long as the renderer lives;
/// deleting the renderer removes what it drew. `printScene`: print the whole scene tree.
void RenderStructure(VizProductStructure& structure, VizBridgeTarvex::VizModelerServices* modeler,
                     bool printScene) {
    KolbaVizCore::RecordingView3D view;
    KolbaVizCore::SceneBuilder scene;
    KolbaVizCore::View3DAdapter adapter(&view, &scene);
    scene.SetView3DAdapter(&adapter);
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());

    std::unique_ptr<VizBridgeTarvex::TarvexRenderer> renderer(
        VizBridgeTarvex::TarvexRenderer::MakeRenderer(&structure, modeler, &scene, 0.0, 0.0, 0.0));
    renderer->SetProgressCallback(&PrintRenderProgress);
    bool const rendered = renderer->Render();
    std::cout << "Rendered: " << (rendered ? "yes" : "no") << ", " << scene.GetNodeCount()
              << " nodes\n";
    if (printScene)
        std::cout << scene.Dump();
    for (auto const& sphere : view.GetExtentSpheres())
        std::cout << "Extents: centre (" << sphere.center[0] << ", " << sphere.center[1] << ", "
                  << sphere.center[2] << "), radius " << sphere.radius << '\n';

    renderer->ClearAll();
    std::cout << "After ClearAll: " << scene.GetNodeCount() << " node(s)\n";
    if (printScene)
        std::cout << scene.Dump();
    renderer.reset(); // before the scene it drew into
}

} // namespace

/// The whole road once, with the import spread over `processors` processes (0: all the
/// machine has; 1: the caller's process alone).
void RunRoad(VizBridgeExamples::SampleAssembly const& sample, int processors) {
    TarvexMultiProcess::SetNumberOfProcessorsToUse(processors);
    TarvexInputProductStructure const input = sample.GetModel().GetInputProductStructure();
    VizReferenceModeler::ReferenceModelerServices modeler;

    std::cout << "Building the product structure\n";
    std::unique_ptr<VizProductStructure> structure = MakeStructure(sample.GetModel(), input);
    std::cout << "Importing\n";
    ImportTimes const times = ImportData(*structure, input, modeler);

    PrintTree(*structure);
    std::cout << "Document:\n";
    PrintDocument(*structure);
    std::cout << "BREP containers: " << structure->GetNumberOfVizPartContainers() << '\n';
    PrintFailures(*structure);
    PrintTimes(times);
    std::cout << "Rendering\n";
    RenderStructure(*structure, &modeler, true);

    // The structure goes last: after the builder and every renderer made on it.
    structure.reset();
}

/// What the visualisation import made of each part of the sample.
void PrintContainers(VizProductStructure const& structure) {
    using Sample = VizBridgeExamples::SampleAssembly;
    struct Part {
        char const* name;
        unsigned int id;
    };
    for (Part const part : {Part{"Bracket", Sample::kBracketId}, Part{"Bolt", Sample::kBoltId},
                            Part{"Cover", Sample::kCoverId}}) {
        int const id = static_cast<int>(part.id);
        std::cout << part.name << " (reference " << id << "), "
                  << (structure.IsVizLoaded(id) ? "loaded" : "not loaded") << '\n';
        if (VizBridgeTarvex::VizContainer const* const container = structure.GetVizContainer(id))
            VizBridgeExamples::PrintVizContainer(std::cout, *container);
        if (VizBridgeTarvex::VizPMIContainer const* const pmi = structure.GetVizPMIContainer(id))
            VizBridgeExamples::PrintVizPMIContainer(std::cout, *pmi);
    }
}

/// The road with tessellated data: import the parts' visualisation data and PMI, print the
/// containers, render them. `tesselateText`: PMI texts become strokes and filled glyphs.
void RunVisualisationRoad(VizBridgeExamples::SampleAssembly const& sample, bool tesselateText) {
    TarvexMultiProcess::SetNumberOfProcessorsToUse(1);
    TarvexInputProductStructure const input = sample.GetModel().GetInputProductStructure();
    std::unique_ptr<VizProductStructure> structure = MakeStructure(sample.GetModel(), input);
    structure->SetTesselatingText(tesselateText); // read by the import, leaf by leaf
    std::cout << "Importing visualisation data and PMI\n";
    ImportVisualisation(*structure, input);
    PrintContainers(*structure);
    PrintFailures(*structure);
    std::cout << "Rendering\n";
    RenderStructure(*structure, nullptr, false);
    structure.reset();
}

int main() {
    try {
        VizPort::ScopedDebugSink const debugToStderr(&PrintDebugText);
        VizBridgeExamples::SampleAssembly const sample;
        std::cout << "=== Import in the caller's process\n";
        RunRoad(sample, 1);
        std::cout << "\n=== Import through the multi-process spooler\n";
        RunRoad(sample, 0);
        std::cout << "\n=== Visualisation data and PMI, texts kept as texts\n";
        RunVisualisationRoad(sample, false);
        std::cout << "\n=== Visualisation data and PMI, texts tessellated\n";
        RunVisualisationRoad(sample, true);
        return 0;
    } catch (std::exception const& e) {
        std::cerr << "vizbridge_demo: " << e.what() << '\n';
        return 1;
    }
}

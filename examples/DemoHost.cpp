// vizbridge_demo: a host that imports the bundled sample assembly and prints what VizBridge
// made of it. Each step of the road is one function below.

#include "ContainerReport.h"
#include "PmiViewing.h"
#include "SampleAssembly.h"
#include "SemanticReport.h"
#include "ViewerQuestions.h"

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/RecordingView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/platform/DebugOutput.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/render/TarvexRenderer.h>
#include <VizBridge/render/UniqueRenderer.h>

#include <chrono>
#include <cstddef>
#include <exception>
#include <iostream>
#include <memory>
#include <string>
#include <vector>

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

/// Step 1: the structure, its document strings, missing files and instance tree. The
/// structure is the host's from here on.
std::unique_ptr<VizProductStructure> MakeStructure(TarvexModel const& model,
                                                   TarvexInputProductStructure const& input) {
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexDocument document = model.GetDocument();
    return VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);
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

/// What one road made, for the summary at the end.
struct RoadSummary {
    std::string road;
    std::size_t instances = 0;
    int containers = 0; ///< part, geometry and PMI containers
    std::size_t errors = 0;
    std::size_t nodes = 0; ///< scene nodes after the render
    double importSeconds = 0.0;
    double renderSeconds = 0.0;
};

double SecondsSince(std::chrono::steady_clock::time_point start) {
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

std::size_t CountInstances(std::vector<VizBridgeTarvex::VizPSEntry*> const& entries) {
    std::size_t count = entries.size();
    for (VizBridgeTarvex::VizPSEntry const* const entry : entries)
        count += CountInstances(entry->GetChildren());
    return count;
}

void Summarise(VizProductStructure const& structure, RoadSummary& summary) {
    summary.instances = CountInstances(structure.GetChildren());
    summary.containers = structure.GetNumberOfVizPartContainers() +
                         structure.GetNumberOfVizContainers() +
                         structure.GetNumberOfVizPMIContainers();
    summary.errors = structure.GetErrorMessages().size();
}

/// Step 5, after a render: what a viewer asks of the PMI. The Bracket stands at z 50 in its
/// assembly; its dimension "Length 60" runs along x at y 0, z 70 in the world.
void ViewPMI(VizProductStructure& structure, KolbaVizCore::SceneBuilder const& scene,
             KolbaVizCore::AView3DAdapter& view) {
    std::cout << "PMI in the scene:\n";
    VizBridgeExamples::PrintPMIScene(std::cout, scene.Dump());
    std::cout << "Picking:\n";
    VizBridgeExamples::PrintPick(std::cout, structure, view, "through the dimension line",
                                 {30, -100, 70}, {0, 1, 0});
    VizBridgeExamples::PrintPick(std::cout, structure, view, "down onto the Bracket's top",
                                 {50, 15, 200}, {0, 0, -1});
    VizBridgeExamples::PrintPick(std::cout, structure, view, "past everything", {500, 500, 500},
                                 {0, 0, 1});
    std::cout << "Activation:\n";
    using Sample = VizBridgeExamples::SampleAssembly;
    if (VizBridgeTarvex::VizPMIContainer const* const pmi =
            structure.GetVizPMIContainer(static_cast<int>(Sample::kBracketId)))
        VizBridgeExamples::ActivateAndPrint(std::cout, structure, *pmi);
}

/// Step 6: what a viewer asks the renderer about picked nodes: entity ids both ways, the
/// paths to highlight and the tool tips. With BREP the ray down onto the Bracket's top meets
/// a modeler face; with tessellated data a mesh face, and the ray along y the dimension.
void AskViewerQuestions(VizProductStructure const& structure,
                        VizBridgeTarvex::TarvexRenderer& renderer,
                        KolbaVizCore::SceneBuilder const& scene,
                        KolbaVizCore::AView3DAdapter& view) {
    std::cout << "Viewer questions:\n";
    using VizBridgeExamples::MakeRay;
    VizBridgeExamples::PrintViewerQuestions(std::cout, renderer, scene, view,
                                            "the face down onto the Bracket's top",
                                            MakeRay({50, 15, 200}, {0, 0, -1}));
    VizBridgeExamples::PrintViewerQuestions(std::cout, renderer, scene, view, "the dimension line",
                                            MakeRay({30, -100, 70}, {0, 1, 0}));
    // The first instance of the first root: the Bracket assembly's node.
    if (!structure.GetChildren().empty() && structure.GetChildren().front()) {
        KolbaVizCore::RenderId instance;
        if (structure.GetChildren().front()->Get3DRenderID(instance))
            VizBridgeExamples::PrintViewerQuestions(std::cout, renderer, scene,
                                                    "the instance BracketAssembly.1", instance);
    }
}

/// Step 4: a renderer draws the structure into the host's scene. The host keeps the scene
/// builder, the view and the modeler (if any) alive for as long as the renderer lives;
/// deleting the renderer removes what it drew. `printScene`: print the whole scene tree.
/// `viewPMI`: print the PMI part of the scene, pick along two rays and activate the
/// Bracket's capture and view. `ask`: ask the viewer questions of step 6.
void RenderStructure(VizProductStructure& structure, VizBridgeTarvex::VizModelerServices* modeler,
                     bool printScene, bool viewPMI, bool ask, RoadSummary& summary) {
    KolbaVizCore::RecordingView3D view;
    KolbaVizCore::SceneBuilder scene;
    KolbaVizCore::View3DAdapter adapter(&view, &scene);
    scene.SetView3DAdapter(&adapter);
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());

    std::unique_ptr<VizBridgeTarvex::TarvexRenderer> renderer =
        VizBridgeTarvex::MakeUniqueRenderer(&structure, modeler, &scene);
    renderer->SetProgressCallback(&PrintRenderProgress);
    auto const start = std::chrono::steady_clock::now();
    bool const rendered = renderer->Render();
    summary.renderSeconds = SecondsSince(start);
    summary.nodes = scene.GetNodeCount();
    std::cout << "Rendered: " << (rendered ? "yes" : "no") << ", " << scene.GetNodeCount()
              << " nodes\n";
    if (printScene)
        std::cout << scene.Dump();
    for (auto const& sphere : view.GetExtentSpheres())
        std::cout << "Extents: centre (" << sphere.center[0] << ", " << sphere.center[1] << ", "
                  << sphere.center[2] << "), radius " << sphere.radius << '\n';
    if (viewPMI)
        ViewPMI(structure, scene, adapter);
    if (ask)
        AskViewerQuestions(structure, *renderer, scene, adapter);

    renderer->ClearAll();
    std::cout << "After ClearAll: " << scene.GetNodeCount() << " node(s)\n";
    if (printScene)
        std::cout << scene.Dump();
    renderer.reset(); // before the scene it drew into
}

} // namespace

/// The whole road once, with the import spread over `processors` processes (0: all the
/// machine has; 1: the caller's process alone).
RoadSummary RunRoad(VizBridgeExamples::SampleAssembly const& sample, int processors) {
    RoadSummary summary{processors == 1 ? "BREP, caller's process" : "BREP, spooler"};
    TarvexMultiProcess::SetNumberOfProcessorsToUse(processors);
    TarvexInputProductStructure const input = sample.GetModel().GetInputProductStructure();
    VizReferenceModeler::ReferenceModelerServices modeler;

    auto const start = std::chrono::steady_clock::now();
    std::cout << "Building the product structure\n";
    std::unique_ptr<VizProductStructure> structure = MakeStructure(sample.GetModel(), input);
    std::cout << "Importing\n";
    ImportTimes const times = ImportData(*structure, input, modeler);
    summary.importSeconds = SecondsSince(start);
    Summarise(*structure, summary);

    PrintTree(*structure);
    std::cout << "Document:\n";
    PrintDocument(*structure);
    std::cout << "BREP containers: " << structure->GetNumberOfVizPartContainers() << '\n';
    PrintFailures(*structure);
    PrintTimes(times);
    std::cout << "Rendering\n";
    RenderStructure(*structure, &modeler, true, false, processors == 1, summary);

    // The structure goes last: after the builder and every renderer made on it.
    structure.reset();
    return summary;
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
RoadSummary RunVisualisationRoad(VizBridgeExamples::SampleAssembly const& sample,
                                 bool tesselateText) {
    RoadSummary summary{tesselateText ? "tessellated, texts as glyphs" : "tessellated, texts"};
    TarvexMultiProcess::SetNumberOfProcessorsToUse(1);
    TarvexInputProductStructure const input = sample.GetModel().GetInputProductStructure();
    auto const start = std::chrono::steady_clock::now();
    std::unique_ptr<VizProductStructure> structure = MakeStructure(sample.GetModel(), input);
    structure->SetTesselatingText(tesselateText); // read by the import, leaf by leaf
    std::cout << "Importing visualisation data and PMI\n";
    ImportVisualisation(*structure, input);
    summary.importSeconds = SecondsSince(start);
    Summarise(*structure, summary);
    PrintContainers(*structure);
    PrintFailures(*structure);
    std::cout << "Rendering\n";
    RenderStructure(*structure, nullptr, false, !tesselateText, !tesselateText, summary);
    structure.reset();
    return summary;
}

void PrintSummary(std::vector<RoadSummary> const& summaries) {
    std::cout << "\n=== Summary\n";
    for (RoadSummary const& s : summaries)
        std::cout << "  " << s.road << ": " << s.instances << " instances, " << s.containers
                  << " containers, " << s.errors << " error texts, " << s.nodes
                  << " scene nodes; import " << s.importSeconds * 1000.0 << " ms, render "
                  << s.renderSeconds * 1000.0 << " ms\n";
}

int main() {
    try {
        VizPort::ScopedDebugSink const debugToStderr(&PrintDebugText);
        std::cout << "==================== vizbridge_demo: the bundled sample assembly "
                     "through VizBridge ====================\n";
        VizBridgeExamples::SampleAssembly const sample;
        std::vector<RoadSummary> summaries;
        std::cout << "=== Import in the caller's process\n";
        summaries.push_back(RunRoad(sample, 1));
        std::cout << "\n=== Import through the multi-process spooler\n";
        summaries.push_back(RunRoad(sample, 0));
        std::cout << "\n=== Visualisation data and PMI, texts kept as texts\n";
        summaries.push_back(RunVisualisationRoad(sample, false));
        std::cout << "\n=== Visualisation data and PMI, texts tessellated\n";
        summaries.push_back(RunVisualisationRoad(sample, true));
        std::cout << "\n=== Semantic PMI of the Bracket, one record per object\n";
        VizBridgeExamples::PrintSemanticRecords(
            std::cout, sample.GetModel(),
            VizBridgeExamples::SamplePMI::Bracket(
                VizBridgeExamples::SampleAssembly::kBracketFirstFaceId));
        PrintSummary(summaries);
        return 0;
    } catch (std::exception const& e) {
        std::cerr << "vizbridge_demo: " << e.what() << '\n';
        return 1;
    }
}

// vizbridge-import: one STEP file through the whole road of a host. See ImportOptions::Usage.

#include "ImportOptions.h"
#include "ProgressBar.h"

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/RecordingView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/render/UniqueRenderer.h>
#include <VizBridge/stepinput/OcctModelerServices.h>
#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/StepReadError.h>

#include <chrono>
#include <cstdio>
#include <exception>
#include <iostream>
#include <memory>
#include <string>
#include <vector>

namespace {

using VizBridgeImporter::ImportOptions;
using VizBridgeTarvex::VizProductStructure;
using VizPort::Narrow;

enum ExitCode { kImported = 0, kUnreadable = 1, kUsage = 2, kInternal = 3 };

/// The import's progress callback is a plain function: it draws on the one bar of the run.
VizBridgeImporter::ProgressBar* g_bar = nullptr;

void ShowProgress(int const& current, int const& total, char16_t const* text) {
    if (g_bar != nullptr)
        g_bar->Show(current, total, text != nullptr ? Narrow(text) : std::string());
}

class Clock {
public:
    double Lap() {
        auto const now = std::chrono::steady_clock::now();
        double const ms = std::chrono::duration<double, std::milli>(now - m_last).count();
        m_last = now;
        return ms;
    }

private:
    std::chrono::steady_clock::time_point m_last = std::chrono::steady_clock::now();
};

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
        {"Units", &VizProductStructure::GetUnits},
    };
    std::cout << "Document:\n";
    for (Field const& field : fields)
        std::cout << "  " << field.label << ": " << Narrow((structure.*field.get)()) << '\n';
}

int Run(ImportOptions const& options) {
    Clock clock;
    std::shared_ptr<VizBridgeStep::StepDocument const> const step =
        VizBridgeStep::StepDocument::Read(options.file);
    double const readMs = clock.Lap();

    TarvexModel const& model = step->Model();
    TarvexMultiProcess::SetNumberOfProcessorsToUse(options.spooler ? 0 : 1);
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();
    std::unique_ptr<VizProductStructure> structure =
        VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);
    // The file's glyphs are already laid out: the text builder gives them as geometry.
    structure->SetTesselatingText(options.pmi);
    double const buildMs = clock.Lap();

    VizBridgeStep::OcctModelerServices modeler(step);
    int processors = 1;
    {
        VizBridgeImporter::ProgressBar bar(stderr, !options.quiet);
        g_bar = &bar;
        VizBridgeTarvex::VizBuilder builder(*structure, input, nullptr);
        builder.SetModelerServices(&modeler);
        builder.SetImportVisu(options.road == ImportOptions::Road::Visualisation);
        builder.SetImportPMI(options.pmi);
        builder.SetProgressCallback(&ShowProgress);
        builder.ImportAndBuildPS();
        processors = builder.GetNumberOfProcessorsUsed();
        g_bar = nullptr;
    }
    double const importMs = clock.Lap();

    KolbaVizCore::RecordingView3D view;
    KolbaVizCore::SceneBuilder scene;
    KolbaVizCore::View3DAdapter adapter(&view, &scene);
    scene.SetView3DAdapter(&adapter);
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    std::unique_ptr<VizBridgeTarvex::TarvexRenderer> renderer =
        VizBridgeTarvex::MakeUniqueRenderer(structure.get(), &modeler, &scene);
    bool const rendered = renderer->Render();
    double const renderMs = clock.Lap();

    std::cout << Narrow(structure->ToString());
    PrintDocument(*structure);
    std::cout << "Errors:\n";
    for (VizPort::WString const& message : structure->GetErrorMessages())
        std::cout << "  " << Narrow(message) << '\n';
    for (std::string const& note : step->Notes())
        std::cout << "  note: " << note << '\n';
    VizBridgeStep::StepCounts const& counts = step->Counts();
    std::cout << "Counts: " << counts.parts << " parts, " << counts.assemblies << " assemblies, "
              << counts.instances << " instances, " << counts.faces << " faces, "
              << counts.triangles << " triangles, " << counts.pmi << " PMI, " << counts.views
              << " views\n"
              << "GD&T: " << counts.gdtObjects << " objects, " << counts.gdtFaceReferences
              << " face references, " << counts.gdtResolvedFaces << " of them resolved\n"
              << "Structure: " << structure->GetNumberOfVizPartContainers() << " BREP containers, "
              << structure->GetNumberOfVizContainers() << " geometry containers, "
              << structure->GetNumberOfVizPMIContainers()
              << " PMI containers; processors used: " << processors << '\n'
              << "Scene: " << (rendered ? "rendered" : "not rendered") << ", "
              << scene.GetNodeCount() << " nodes\n";
    if (options.scene)
        std::cout << scene.Dump();
    std::cout << "Times (ms): read " << readMs << ", build " << buildMs << ", import " << importMs
              << ", render " << renderMs << '\n';

    renderer.reset(); // before the scene and the structure it points at
    return rendered ? kImported : kInternal;
}

} // namespace

int main(int argc, char** argv) {
    std::vector<std::string> const arguments(argv + 1, argv + argc);
    std::string error;
    std::optional<ImportOptions> const options = ImportOptions::Parse(arguments, error);
    if (!options) {
        if (error.empty()) {
            std::cout << ImportOptions::Usage();
            return kImported;
        }
        // The error and the usage line; --help gives the rest.
        std::string const usage = ImportOptions::Usage();
        std::cerr << "vizbridge-import: " << error << '\n'
                  << usage.substr(0, usage.find('\n') + 1) << "Try 'vizbridge-import --help'.\n";
        return kUsage;
    }
    try {
        return Run(*options);
    } catch (VizBridgeStep::StepReadError const& e) {
        std::cerr << "vizbridge-import: " << e.what() << '\n';
        return kUnreadable;
    } catch (std::exception const& e) {
        std::cerr << "vizbridge-import: internal failure: " << e.what() << '\n';
        return kInternal;
    } catch (...) {
        std::cerr << "vizbridge-import: internal failure\n";
        return kInternal;
    }
}

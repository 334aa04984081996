// A real model end to end: the NIST CTC 02 STEP file (one part of 637 faces, 46 annotations,
// three saved views), in one run:
//
//   BM_OpenCascadeAlone   Open CASCADE's own work on the file: STEPCAFControl_Reader's read
//                         and transfer into an XCAF document, then BRepMesh of every shape
//                         with the reader's deflections, in parallel.
//   BM_VizBridgeRoad      the whole road of a host: StepDocument::Read (that same work, and
//                         the import library's model filled from it), MakeVizProductStructure,
//                         ImportAndBuildPS of the tessellated data and the PMI, and Render
//                         into an empty scene.
//
// The ratio of the two times is what VizBridge costs on top of Open CASCADE's own work.
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/render/UniqueRenderer.h>
#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/XcafDocument.h>

#include <BRepMesh_IncrementalMesh.hxx>
#include <Message.hxx>
#include <Message_Messenger.hxx>
#include <STEPCAFControl_Reader.hxx>
#include <STEPControl_Controller.hxx>
#include <TDF_LabelSequence.hxx>
#include <TDocStd_Document.hxx>
#include <XCAFApp_Application.hxx>
#include <XCAFDoc_DocumentTool.hxx>
#include <XCAFDoc_ShapeTool.hxx>

#include <benchmark/benchmark.h>

#include <memory>
#include <stdexcept>
#include <string>

namespace {

std::string const kFile =
    std::string(VIZBRIDGE_TEST_DATA) + "/step-pmi/nist_ctc_02_asme1_ap242-e2.stp";

void BM_OpenCascadeAlone(benchmark::State& state) {
    Message::DefaultMessenger()->ChangePrinters().Clear(); // as the reader runs: silently
    STEPControl_Controller::Init();
    VizBridgeStep::StepReadOptions const options;
    for (auto _ : state) {
        VizBridgeStep::XcafDocument const xcaf;
        Handle(TDocStd_Document) document = xcaf.Get();
        STEPCAFControl_Reader reader;
        reader.SetColorMode(true);
        reader.SetNameMode(true);
        reader.SetLayerMode(true);
        reader.SetGDTMode(true);
        reader.SetViewMode(true);
        reader.SetPropsMode(false); // as VizBridge reads
        if (reader.ReadFile(kFile.c_str()) != IFSelect_RetDone || !reader.Transfer(document))
            throw std::runtime_error("Open CASCADE could not read " + kFile);
        TDF_LabelSequence shapes;
        XCAFDoc_DocumentTool::ShapeTool(document->Main())->GetFreeShapes(shapes);
        for (int i = 1; i <= shapes.Length(); ++i)
            BRepMesh_IncrementalMesh(XCAFDoc_ShapeTool::GetShape(shapes(i)),
                                     options.linearDeflection, false, options.angularDeflection,
                                     options.parallelMeshing);
    }
}

void BM_VizBridgeRoad(benchmark::State& state) {
    TarvexMultiProcess::SetNumberOfProcessorsToUse(1);
    for (auto _ : state) {
        std::shared_ptr<VizBridgeStep::StepDocument const> const step =
            VizBridgeStep::StepDocument::Read(kFile);
        TarvexPSImportResult const result = step->Model().GetImportResult();
        TarvexInputProductStructure const input = step->Model().GetInputProductStructure();
        TarvexDocument document = step->Model().GetDocument();
        auto const structure =
            VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);
        structure->SetTesselatingText(true);
        VizBridgeTarvex::VizBuilder builder(*structure, input, nullptr);
        builder.SetImportVisu(true);
        builder.SetImportPMI(true);
        builder.ImportAndBuildPS();
        KolbaVizCore::SceneBuilder scene;
        scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
        auto const renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, &scene);
        if (!renderer->Render())
            throw std::runtime_error("the render failed");
        state.counters["triangles"] = step->Counts().triangles;
        state.counters["nodes"] = static_cast<double>(scene.GetNodeCount());
    }
}

BENCHMARK(BM_OpenCascadeAlone)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(3);
BENCHMARK(BM_VizBridgeRoad)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(3);

} // namespace

BENCHMARK_MAIN();

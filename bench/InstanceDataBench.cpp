// The instance data phase on 200 parts whose conversion costs about 5 ms of processor time
// each: in the caller's process (every conversion on the calling thread, as the modeler
// asks for it) against the multi-process spooler (conversions ahead of time on worker
// threads, one per processor). Both import through the reference modeler.
//
// Conversions are cached in the model, so each iteration authors a fresh one outside the
// timed region. Wall-clock time is what a host waits for: the benchmarks use real time.

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>

#include <benchmark/benchmark.h>

#include <memory>
#include <string>

namespace {

using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;

constexpr unsigned int kParts = 200;
constexpr unsigned int kConversionCostMicroseconds = 5000;

std::u16string Name(unsigned int number) {
    std::string const text = "Part" + std::to_string(number);
    return std::u16string(text.begin(), text.end());
}

/// One sub-assembly placing every part once; each part a single triangle plus its cost.
std::unique_ptr<TarvexModel> MakeModel() {
    auto model = std::make_unique<TarvexModel>();
    model->SetProductName(u"Bench");
    model->AddAssembly(10000, u"Top");
    model->AddRootInstance(10000, u"Top.1");
    for (unsigned int part = 1; part <= kParts; ++part) {
        TarvexAuthoredReference& reference = model->AddPart(part, Name(part));
        TarvexAuthoredFace face;
        face.entityId = 1;
        face.vertices = {0, 0, 0, 1, 0, 0, 0, 1, 0};
        face.triangles = {0, 1, 2};
        reference.geometry.faces.push_back(face);
        reference.geometry.conversionCostMicroseconds = kConversionCostMicroseconds;
        model->AddInstance(10000, part, Name(part));
    }
    return model;
}

void Import(benchmark::State& state, int processorsToUse) {
    TarvexScopedProcessors const processors(processorsToUse, std::nullopt);
    VizReferenceModeler::ReferenceModelerServices modeler;
    int processorsUsed = 0;
    for (auto _ : state) {
        state.PauseTiming();
        std::unique_ptr<TarvexModel> const model = MakeModel();
        TarvexInputProductStructure const input = model->GetInputProductStructure();
        TarvexDocument document = model->GetDocument();
        VizProductStructure* raw = nullptr;
        VizBuilder::MakeVizProductStructure(model->GetImportResult(), input, document, raw);
        std::unique_ptr<VizProductStructure> const structure(raw); // the host owns it
        state.ResumeTiming();

        VizBuilder builder(*structure, input, nullptr);
        builder.SetModelerServices(&modeler);
        builder.ImportAndBuildPS();

        state.PauseTiming();
        processorsUsed = builder.GetNumberOfProcessorsUsed();
        if (structure->GetNumberOfVizPartContainers() != static_cast<int>(kParts))
            state.SkipWithError("not every part was imported");
        state.ResumeTiming();
    }
    state.SetItemsProcessed(state.iterations() * kParts);
    state.counters["processors"] = processorsUsed;
}

void BM_ImportSingleProcess(benchmark::State& state) {
    Import(state, 1);
}
void BM_ImportMultiProcess(benchmark::State& state) {
    Import(state, 0);
}

BENCHMARK(BM_ImportSingleProcess)->Unit(benchmark::kMillisecond)->UseRealTime()->MinTime(3.0);
BENCHMARK(BM_ImportMultiProcess)->Unit(benchmark::kMillisecond)->UseRealTime()->MinTime(3.0);

} // namespace

BENCHMARK_MAIN();

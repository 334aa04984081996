// Speed and memory of drawing PMI, and of picking in the drawn scene.
//
// The product: 1 000 part references, each with 50 PMI objects (notes of one polyline of
// two segments each, imported as a host imports graphical PMI) and 10 root instances that
// place it in turn. The renderer draws each reference's PMI below its first instance;
// every further instance gets a node with its placement and a node reference to it.
//
//   BM_RenderPMI/N  renders the product, with N PMI objects a reference, into an empty
//                   scene; the scene is cleared outside the timed region.
//     pmi_per_second              PMI objects drawn per second (N x 1 000 a render)
//     bytes_per_further_instance  (growth(10 000) - growth(1 000)) / 9 000, where growth(I)
//                                 is the heap growth of rendering the references with I
//                                 instances in all: what an instance costs beyond the
//                                 first of its reference, which stays flat in N
//   BM_PickVisual   VizProductStructure::PickVisual along rays straight down through the
//                   PMI of instances spread over the product.
//     picks_per_second            rays answered per second
//     hit_ratio                   of those rays, the share that found an element and an
//                                 instance
//   BM_SceneNodePick  the same rays through the scene library's own pick of a node, which
//                   PickVisual asks once: what the rest of PickVisual costs beside it.
// Heap bytes are those requested from operator new.

#include "support/BenchProduct.h"
#include "support/LiveBytes.h"
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/render/TarvexRenderer.h>
#include <VizBridge/render/UniqueRenderer.h>

#include <benchmark/benchmark.h>

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

using VizBridgeBench::LiveBytes;

namespace {

using KolbaVizCore::SceneBuilder;
using VizBridgeTarvex::VizProductStructure;

constexpr unsigned int kReferences = 1000;
constexpr unsigned int kPMIPerReference = 50; ///< unless a benchmark's argument says otherwise
constexpr unsigned int kInstancesPerReference = 10;
constexpr double kSpacing = 200.0; ///< between instances, beyond a reference's PMI

/// `stem` and `number` as one text. Appended, not added: GCC 12 warns wrongly about
/// `"text" + std::string` in optimised builds.
VizPort::WString Named(char const* stem, unsigned int number) {
    std::string name = stem;
    name += std::to_string(number);
    return VizPort::Widen(name);
}

/// `count` notes side by side along x, each a polyline over (2k, 0, 0) (2k + 1, 0, 0)
/// (2k + 1, 1, 0).
TarvexAuthoredVisuData PMI(unsigned int count) {
    TarvexAuthoredVisuData made;
    made.unit = TarvexLengthUnit_Millimeter;
    for (unsigned int k = 0; k < count; ++k) {
        TarvexAuthoredVisuNode& note = made.nodes.emplace_back();
        note.type = TarvexVisuNode::VisuNote;
        note.pmi.id = Named("note", k);
        TarvexAuthoredVisuEdge& line = note.pmi.edges.emplace_back();
        float const x = 2.0f * static_cast<float>(k);
        line.points = {x, 0, 0, x + 1, 0, 0, x + 1, 1, 0};
        line.lineIndices = std::vector<int>{0, 3, 6}; // float offsets of the points
    }
    return made;
}

/// `perReference` root instances of each reference, imported with `pmi` PMI objects each.
std::unique_ptr<VizProductStructure> MakeProduct(unsigned int perReference,
                                                 unsigned int pmi = kPMIPerReference) {
    TarvexAuthoredVisuData const data = PMI(pmi);
    TarvexModel model;
    model.SetProductName(u"PmiRenderBench");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    for (unsigned int reference = 1; reference <= kReferences; ++reference)
        model.AddPart(reference, Named("Part", reference)).visu = data;
    for (unsigned int copy = 0; copy < perReference; ++copy) {
        for (unsigned int reference = 1; reference <= kReferences; ++reference) {
            TarvexPlacement placement;
            placement.translation[0] = kSpacing * (reference - 1);
            placement.translation[1] = kSpacing * copy;
            model.AddRootInstance(reference, Named("P", reference) + u"." + Named("", copy))
                .placement = placement;
        }
    }
    return VizBridgeBench::ImportTessellated(model, true);
}

/// Heap growth of one render of a product with `perReference` instances of each reference.
std::int64_t RenderGrowth(unsigned int perReference, unsigned int pmi) {
    std::unique_ptr<VizProductStructure> const structure = MakeProduct(perReference, pmi);
    std::unique_ptr<SceneBuilder> const scene = VizBridgeBench::MakeScene();
    auto const renderer =
        VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, scene.get());
    std::int64_t const before = LiveBytes();
    bool const rendered = renderer->Render();
    return rendered ? LiveBytes() - before : 0;
}

void BM_RenderPMI(benchmark::State& state) {
    auto const pmi = static_cast<unsigned int>(state.range(0));
    std::unique_ptr<VizProductStructure> const structure = MakeProduct(kInstancesPerReference, pmi);
    std::size_t imported = 0;
    for (auto const& [id, container] : structure->GetAllVizPMIContainers())
        imported += container ? container->GetVizPMIs().size() : 0;
    if (imported != std::size_t{kReferences} * pmi) {
        state.SkipWithError("the PMI was not imported");
        return;
    }
    std::int64_t const growthOne = RenderGrowth(1, pmi);
    std::int64_t const growthAll = RenderGrowth(kInstancesPerReference, pmi);
    if (growthOne == 0 || growthAll == 0) {
        state.SkipWithError("a render failed");
        return;
    }
    std::unique_ptr<SceneBuilder> const scene = VizBridgeBench::MakeScene();
    for (auto _ : state) {
        auto renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, scene.get());
        if (!renderer->Render()) {
            state.SkipWithError("the render failed");
            return;
        }
        state.PauseTiming();
        renderer.reset(); // removes its nodes from the scene
        state.ResumeTiming();
    }
    state.counters["pmi_per_second"] = benchmark::Counter(
        static_cast<double>(state.iterations()) * kReferences * pmi, benchmark::Counter::kIsRate);
    state.counters["bytes_per_further_instance"] =
        static_cast<double>(growthAll - growthOne) /
        static_cast<double>(kReferences * (kInstancesPerReference - 1));
}
// 5 and 50 PMI a reference: a further instance must cost the same whatever the PMI holds.
BENCHMARK(BM_RenderPMI)->Arg(5)->Arg(50)->Unit(benchmark::kMillisecond)->Iterations(3);

/// Ray `index` of a run: down through the first segment of note (index % 50) of an instance
/// that moves on by a prime step, so that the rays spread over the product.
KolbaVizCore::Ray RayNumber(std::int64_t index) {
    std::int64_t const instance = (index * 7919) % (kReferences * kInstancesPerReference);
    KolbaVizCore::Ray ray;
    ray.origin[0] = kSpacing * static_cast<double>(instance % kReferences) +
                    2.0 * static_cast<double>(index % kPMIPerReference) + 0.5;
    ray.origin[1] = kSpacing * static_cast<double>(instance / kReferences);
    ray.origin[2] = 10.0;
    ray.direction[2] = -1.0;
    return ray;
}

/// Picks in the rendered product: with `wholeQuestion`, what a host asks of the structure
/// (PickVisual); without, the scene library's pick of a node alone, for comparison.
void PickInRenderedProduct(benchmark::State& state, bool wholeQuestion) {
    std::unique_ptr<VizProductStructure> const structure = MakeProduct(kInstancesPerReference);
    std::unique_ptr<SceneBuilder> const scene = VizBridgeBench::MakeScene();
    KolbaVizCore::View3DAdapter adapter(nullptr, scene.get());
    scene->SetView3DAdapter(&adapter);
    auto const renderer =
        VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, scene.get());
    if (!renderer->Render()) {
        state.SkipWithError("the render failed");
        return;
    }
    std::int64_t rays = 0;
    std::int64_t hits = 0;
    for (auto _ : state) {
        KolbaVizCore::Ray const ray = RayNumber(rays++);
        if (wholeQuestion) {
            VizBridgeTarvex::VizElement* element = nullptr;
            VizBridgeTarvex::VizPSEntry* entry = nullptr;
            if (structure->PickVisual(&adapter, ray, element, entry) && element && entry)
                ++hits;
        } else {
            KolbaVizCore::RenderId picked;
            double distance = 0.0;
            if (scene->Pick(ray, picked, distance))
                ++hits;
        }
    }
    state.counters["picks_per_second"] =
        benchmark::Counter(static_cast<double>(rays), benchmark::Counter::kIsRate);
    state.counters["hit_ratio"] = rays == 0 ? 0.0 : static_cast<double>(hits) / rays;
}

void BM_PickVisual(benchmark::State& state) {
    PickInRenderedProduct(state, true);
}
BENCHMARK(BM_PickVisual)->Unit(benchmark::kMillisecond)->Iterations(20);

void BM_SceneNodePick(benchmark::State& state) {
    PickInRenderedProduct(state, false);
}
BENCHMARK(BM_SceneNodePick)->Unit(benchmark::kMillisecond)->Iterations(20);

} // namespace

BENCHMARK_MAIN();

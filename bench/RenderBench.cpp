// Speed and memory of TarvexRenderer::Render on a product of many instances of few references.
//
// The product: 1 000 part references (ids 1..1000), each with tessellated geometry - one
// mesh of 20 faces, each face one polygon of 100 triangles, so 2 000 triangles a reference,
// imported as a host imports it - and N root instances (10 000 or 100 000) that place the
// references in turn, each at a translation of its own. The renderer draws a reference
// below its first instance; every further instance gets a node with its placement and a
// node reference to that drawing.
//
// The structure is made once per size; each iteration renders it into an empty scene and
// then clears the scene outside the timed region, as a host does before drawing again.
// Memory and counts come from the first render, into a new builder: later renders grow the
// heap a little less, as the entries keep the render ids they were given the first time.
//
// Counters:
//   instances_per_second        instances rendered per second
//   items_per_second            geometry items the render put into the scene per second:
//                               the items the scene's nodes own, one per polygon drawn
//   items, items_shown, nodes   after one render: items the nodes own, items shown through
//                               the node references as well, nodes the builder owns
//   bytes_per_instance          heap growth of one render, divided by N
//   bytes_per_further_instance  (growth(N) - growth(1 000)) / (N - 1 000): what an instance
//                               costs beyond the first instance of its reference
//   drawing_bytes_per_reference growth(1 000) less 1 000 further instances, divided by
//                               1 000: the drawing of one reference
// growth(1 000) is the heap growth of rendering the same references with one instance each,
// measured once for the whole run. Heap bytes are those requested from operator new; the
// allocator's own overhead is not counted.

#include "support/BenchProduct.h"
#include "support/LiveBytes.h"
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
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

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

using VizBridgeBench::LiveBytes;

namespace {

using KolbaVizCore::Node;
using KolbaVizCore::SceneBuilder;
using VizBridgeTarvex::TarvexRenderer;
using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;

constexpr unsigned int kReferences = 1000;
constexpr unsigned int kFacesPerMesh = 20;
constexpr unsigned int kTrianglesPerFace = 100;
constexpr std::int64_t kItemsPerReference = kFacesPerMesh; // one polygon item per face

/// One face: a band of two rows of points, 100 triangles between them. Indices are float
/// offsets, three a triangle.
TarvexAuthoredVisuFace MakeBand(float y) {
    constexpr unsigned int columns = kTrianglesPerFace / 2 + 1;
    TarvexAuthoredVisuFace band;
    for (unsigned int row = 0; row < 2; ++row) {
        for (unsigned int column = 0; column < columns; ++column) {
            band.vertices.insert(band.vertices.end(),
                                 {static_cast<float>(column), y + static_cast<float>(row), 0.0f});
            band.normals.insert(band.normals.end(), {0.0f, 0.0f, 1.0f});
        }
    }
    std::vector<int> indices;
    for (unsigned int column = 0; column + 1 < columns; ++column) {
        int const low = static_cast<int>(column);
        int const high = static_cast<int>(columns + column);
        indices.insert(indices.end(), {3 * low, 3 * (low + 1), 3 * high});
        indices.insert(indices.end(), {3 * (low + 1), 3 * (high + 1), 3 * high});
    }
    band.polygons.push_back(
        TarvexAuthoredVisuPolygon{std::move(indices), TarvexVisuPolygon_Triangles});
    return band;
}

/// The tessellated geometry of every reference: one mesh of 2 000 triangles.
TarvexAuthoredVisuData const& Geometry() {
    static TarvexAuthoredVisuData const data = [] {
        TarvexAuthoredVisuData made;
        made.unit = TarvexLengthUnit_Millimeter;
        TarvexAuthoredVisuNode& mesh = made.nodes.emplace_back();
        mesh.type = TarvexVisuNode::VisuMesh;
        for (unsigned int face = 0; face < kFacesPerMesh; ++face)
            mesh.mesh.faces.push_back(MakeBand(static_cast<float>(2 * face)));
        return made;
    }();
    return data;
}

VizPort::WString Name(char const* stem, unsigned int number, unsigned int copy) {
    return VizPort::Widen(stem + std::to_string(number) + "." + std::to_string(copy));
}

/// `instances` root instances over the 1 000 references, each reference's geometry imported
/// the way a host imports tessellated data.
std::unique_ptr<VizProductStructure> MakeProduct(unsigned int instances) {
    TarvexModel model;
    model.SetProductName(u"RenderBench");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    for (unsigned int reference = 1; reference <= kReferences; ++reference)
        model.AddPart(reference, VizPort::Widen("Part" + std::to_string(reference))).visu =
            Geometry();
    for (unsigned int instance = 0; instance < instances; ++instance) {
        unsigned int const reference = instance % kReferences + 1;
        TarvexPlacement placement;
        placement.translation[0] = 100.0 * (instance % kReferences);
        placement.translation[1] = 100.0 * (instance / kReferences);
        model.AddRootInstance(reference, Name("Part", reference, instance / kReferences + 1))
            .placement = placement;
    }

    return VizBridgeBench::ImportTessellated(model, false);
}

std::unique_ptr<TarvexRenderer> MakeRenderer(VizProductStructure& structure,
                                             SceneBuilder& builder) {
    return VizBridgeTarvex::MakeUniqueRenderer(&structure, nullptr, &builder);
}

struct SceneCount {
    std::int64_t items = 0;      ///< owned by the nodes
    std::int64_t itemsShown = 0; ///< owned, and shown again through references
};

void CountOwned(Node const& node, SceneCount& count) {
    count.items += static_cast<std::int64_t>(node.GetItemCount());
    for (std::size_t child = 0; child < node.GetChildCount(); ++child)
        CountOwned(*node.GetChild(child), count);
}

std::int64_t CountShown(Node const& node) {
    std::int64_t shown = static_cast<std::int64_t>(node.GetItemCount());
    for (std::size_t child = 0; child < node.GetChildCount(); ++child)
        shown += CountShown(*node.GetChild(child));
    for (std::size_t reference = 0; reference < node.GetReferenceCount(); ++reference)
        shown += CountShown(*node.GetReference(reference));
    return shown;
}

SceneCount CountScene(SceneBuilder const& builder) {
    SceneCount count;
    for (std::size_t scene = 0; scene < builder.GetSceneCount(); ++scene) {
        CountOwned(*builder.GetScene(scene), count);
        count.itemsShown += CountShown(*builder.GetScene(scene));
    }
    return count;
}

/// Heap growth of rendering every reference once into an empty scene; 0 if that render
/// failed.
std::int64_t OneInstanceEachGrowth() {
    static std::int64_t const growth = [] {
        std::unique_ptr<VizProductStructure> const structure = MakeProduct(kReferences);
        std::unique_ptr<SceneBuilder> const builder = VizBridgeBench::MakeScene();
        std::unique_ptr<TarvexRenderer> const renderer = MakeRenderer(*structure, *builder);
        std::int64_t const before = LiveBytes();
        bool const rendered = renderer->Render();
        std::int64_t const grown = LiveBytes() - before;
        return rendered && CountScene(*builder).items == kReferences * kItemsPerReference
                   ? grown
                   : std::int64_t{0};
    }();
    return growth;
}

void BM_Render(benchmark::State& state) {
    auto const instances = static_cast<unsigned int>(state.range(0));
    std::int64_t const baseline = OneInstanceEachGrowth();
    if (baseline == 0) {
        state.SkipWithError("rendering one instance of each reference failed");
        return;
    }
    std::unique_ptr<VizProductStructure> const structure = MakeProduct(instances);
    std::unique_ptr<SceneBuilder> const builder = VizBridgeBench::MakeScene();
    std::unique_ptr<TarvexRenderer> const renderer = MakeRenderer(*structure, *builder);

    std::int64_t growth = 0;
    SceneCount count;
    std::int64_t nodes = 0;
    bool rendered = true;
    for (auto _ : state) {
        std::int64_t const before = LiveBytes();
        rendered = renderer->Render() && rendered;
        state.PauseTiming();
        if (nodes == 0) {
            growth = LiveBytes() - before;
            count = CountScene(*builder);
            nodes = static_cast<std::int64_t>(builder->GetNodeCount());
        }
        renderer->ClearAll();
        state.ResumeTiming();
    }

    if (!rendered) {
        state.SkipWithError("a render failed");
        return;
    }
    if (count.items != kReferences * kItemsPerReference ||
        count.itemsShown != std::int64_t{instances} * kItemsPerReference) {
        state.SkipWithError("the scene does not draw each reference once and show it per instance");
        return;
    }
    auto const instanceCount = static_cast<double>(instances);
    auto const furtherInstances = static_cast<double>(instances - kReferences);
    double const furtherBytes = static_cast<double>(growth - baseline) / furtherInstances;
    using benchmark::Counter;
    state.counters["instances_per_second"] =
        Counter(instanceCount, Counter::kIsIterationInvariantRate);
    state.counters["items_per_second"] =
        Counter(static_cast<double>(count.items), Counter::kIsIterationInvariantRate);
    state.counters["items"] = static_cast<double>(count.items);
    state.counters["items_shown"] = static_cast<double>(count.itemsShown);
    state.counters["nodes"] = static_cast<double>(nodes);
    state.counters["bytes_per_instance"] = static_cast<double>(growth) / instanceCount;
    state.counters["bytes_per_further_instance"] = furtherBytes;
    state.counters["drawing_bytes_per_reference"] =
        (static_cast<double>(baseline) - kReferences * furtherBytes) / kReferences;
}

BENCHMARK(BM_Render)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond)->MinTime(2.0);

} // namespace

BENCHMARK_MAIN();

// The questions a viewer asks the product renderer on every mouse move, on products of
// 1 000, 10 000 and 100 000 root instances over 100 part references (one triangle each).
//
// Each benchmark renders its product once, then asks in turn about instances spread over the
// whole product:
//   BM_PathToEntity     Convert(RenderId, EntityId) of a path five levels below an instance
//                       node, which only the instance records can place (deepest instance
//                       above the pick);
//   BM_EntityToPath     Convert(EntityId, RenderId) of an instance's part record;
//   BM_Highlight        ConvertToHighlight of the same deep path (several roots: the
//                       deepest recorded instance above it).
// Each also runs with the argument `walk` = 1, where the same questions are answered by
// walking the records in key order (a std::map of the renderer's records), as the
// questions are defined; `walk` = 0 is the renderer itself. Counter `per_second`: answers
// a second.

#include "support/BenchProduct.h"
#include "support/LinkMapWalk.h"
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/render/TarvexRenderer.h>

#include <benchmark/benchmark.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace {

using VizBridgeTarvex::EntityId;
using VizBridgeTarvex::RenderId;
using VizBridgeTarvex::TarvexRenderer;

constexpr unsigned int kReferences = 100;
constexpr int kQueries = 1024;

/// The renderer with its records in reach.
class Renderer : public TarvexRenderer {
public:
    Renderer(VizBridgeTarvex::VizProductStructure* structure, KolbaVizCore::SceneBuilder* builder)
        : TarvexRenderer(structure, builder, nullptr, 0, 0, 0) {}
    using TarvexRenderer::linkMap;
};

/// A rendered product of `instances` root instances, the walk's records and the questions.
struct Scene {
    explicit Scene(unsigned int instances) {
        TarvexModel model;
        TarvexAuthoredVisuData triangle;
        TarvexAuthoredVisuNode& mesh = triangle.nodes.emplace_back();
        mesh.type = TarvexVisuNode::VisuMesh;
        TarvexAuthoredVisuFace& face = mesh.mesh.faces.emplace_back();
        face.vertices = {0, 0, 0, 1, 0, 0, 0, 1, 0};
        face.polygons.push_back(
            TarvexAuthoredVisuPolygon{std::vector<int>{0, 3, 6}, TarvexVisuPolygon_Triangles});
        for (unsigned int reference = 1; reference <= kReferences; ++reference)
            model.AddPart(reference, VizPort::Widen(std::to_string(reference))).visu = triangle;
        for (unsigned int instance = 0; instance < instances; ++instance)
            model.AddRootInstance(instance % kReferences + 1, u"I");
        structure = VizBridgeBench::ImportTessellated(model, false);
        builder = VizBridgeBench::MakeScene();
        renderer = std::make_unique<Renderer>(structure.get(), builder.get());
        rendered = renderer->Render();
        for (auto const& [key, path] : renderer->linkMap().Records())
            records.emplace(key, path);
        RenderId const product = renderer->GetProductRenderId();
        for (int query = 0; query < kQueries; ++query) {
            // Spread over the whole product, first to last instance.
            auto const tag =
                static_cast<std::uint32_t>(1000 + query * (instances - 1) / (kQueries - 1));
            RenderId deep = product;
            for (std::uint32_t const below : {tag, 10007u, 10006u, 5u, 10002u, 1u})
                deep.AddValue(below);
            picks.push_back(deep);
            entities.emplace_back(tag, TarvexRenderer::PartRecordType, tag);
        }
    }

    std::unique_ptr<VizBridgeTarvex::VizProductStructure> structure;
    std::unique_ptr<KolbaVizCore::SceneBuilder> builder;
    std::unique_ptr<Renderer> renderer;
    bool rendered = false;
    VizBridgeTest::Records records;
    std::vector<RenderId> picks;
    std::vector<EntityId> entities;
};

Scene& SceneOf(unsigned int instances) {
    static std::map<unsigned int, std::unique_ptr<Scene>> scenes;
    std::unique_ptr<Scene>& scene = scenes[instances];
    if (!scene)
        scene = std::make_unique<Scene>(instances);
    return *scene;
}

/// Runs `ask(query)` for each iteration over the queries in turn; false answers are errors.
template <typename Ask> void Run(benchmark::State& state, Ask const& ask) {
    Scene& scene = SceneOf(static_cast<unsigned int>(state.range(0)));
    if (!scene.rendered) {
        state.SkipWithError("the render failed");
        return;
    }
    int query = 0;
    bool answered = true;
    for (auto _ : state) {
        answered = ask(scene, query) && answered;
        query = (query + 1) % kQueries;
    }
    if (!answered)
        state.SkipWithError("a question went unanswered");
    state.counters["per_second"] =
        benchmark::Counter(1, benchmark::Counter::kIsIterationInvariantRate);
}

void BM_PathToEntity(benchmark::State& state) {
    bool const walk = state.range(1) != 0;
    Run(state, [walk](Scene& scene, int query) {
        if (walk)
            return VizBridgeTest::walkLongestPrefix(scene.records, scene.picks[query]).found;
        EntityId entity;
        return scene.renderer->Convert(scene.picks[query], entity);
    });
}

void BM_EntityToPath(benchmark::State& state) {
    bool const walk = state.range(1) != 0;
    Run(state, [walk](Scene& scene, int query) {
        EntityId const& entity = scene.entities[query];
        if (walk)
            return VizBridgeTest::walkFirstWithId(scene.records, entity.GetId()).found;
        RenderId path;
        return scene.renderer->Convert(entity, path);
    });
}

void BM_Highlight(benchmark::State& state) {
    bool const walk = state.range(1) != 0;
    Run(state, [walk](Scene& scene, int query) {
        if (walk)
            return VizBridgeTest::walkLongestPrefix(scene.records, scene.picks[query]).found;
        RenderId* raw = nullptr;
        int count = 0;
        bool const answered = scene.renderer->ConvertToHighlight(scene.picks[query], raw, count);
        std::unique_ptr<RenderId[]> const paths(raw); // the caller's, released as an array
        return answered;
    });
}

void Sizes(benchmark::internal::Benchmark* benchmark) {
    for (int const instances : {1000, 10000, 100000})
        for (int const walk : {0, 1})
            benchmark->Args({instances, walk});
    benchmark->ArgNames({"instances", "walk"})->MinTime(0.2);
}

BENCHMARK(BM_PathToEntity)->Apply(Sizes);
BENCHMARK(BM_EntityToPath)->Apply(Sizes);
BENCHMARK(BM_Highlight)->Apply(Sizes);

} // namespace

BENCHMARK_MAIN();

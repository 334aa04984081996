// The frame around TarvexRenderer's walk: its answer, progress, dbg texts and lock, the
// extents, clearing, copies, explode factors and the modeler's renderers.
#include "support/BrepTestModeler.h"
#include "support/RenderFixture.h"
#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/kolba/Dbg.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>

using namespace VizBridgeTarvex;

namespace {

using Peer = VizProductStructureTestPeer;
using Structure = std::unique_ptr<VizProductStructure>;
using Outcome = TestBrepRenderer::Outcome;

/// Fail the walk at its first part, as a broken host callback would.
void throwAtFirstPart(int const& done, int const& total, char const* phase) {
    recordProgress(done, total, phase);
    if (std::string(phase) == "RenderPart")
        throw std::runtime_error("walk broke");
}
void throwSomethingElse(int const& done, int const& total, char const* phase) {
    recordProgress(done, total, phase);
    if (std::string(phase) == "RenderPart")
        throw 42;
}

/// The plate whose parts P (10) and Q (20) hold part containers as well.
Structure brepPlate() {
    Structure structure = plate();
    Peer::addPartContainer(*structure, 10, new TestPartContainer(u"P", 10));
    Peer::addPartContainer(*structure, 20, new TestPartContainer(u"Q", 20));
    return structure;
}

struct FrameCase {
    char const* name;
    std::function<Structure()> structure;
    KolbaVizCore::ARenderer::ProgressCallback callback;
    bool builder;
    bool throwingModeler;
    bool allowThrow; ///< the scene library's throw switch
    bool result;
    char const* progress;
    char const* dbg;
    bool again; ///< what a second render, from another thread and without callback, answers
};

} // namespace

TEST(TarvexRendererFrame, AnswersReportsProgressAndSaysOnDbgWhatWentWrong) {
    FrameCase const cases[] = {
        {"a whole product: a further instance adds no part to the count", [] { return plate(); },
         recordProgress, true, false, false, true,
         "0/2 RenderInit\n1/2 RenderPart\n2/2 RenderPart\n2/2 RenderPart\n2/2 RenderEnd\n", "",
         true},
        {"an empty product", [] { return buildStructure(TarvexModel()); }, recordProgress, true,
         false, false, true, "0/0 RenderInit\n1/1 RenderEnd\n", "", true},
        {"a walk that throws with the throw switch on", [] { return plate(); }, throwAtFirstPart,
         true, false, true, false, "0/2 RenderInit\n1/2 RenderPart\n2/2 RenderEnd\n",
         "TarvexRenderer::Render : walk broke\n", true},
        {"a walk that throws something else", [] { return plate(); }, throwSomethingElse, true,
         false, false, false, "0/2 RenderInit\n1/2 RenderPart\n2/2 RenderEnd\n",
         "TarvexRenderer::Render : Unhandled Exception\n", true},
        {"a modeler renderer that throws", brepPlate, recordProgress, true, true, false, false,
         "0/4 RenderInit\n1/4 RenderPart\n4/4 RenderEnd\n",
         "TarvexRenderer::Render : modeler renderer broke\n", false},
        {"no structure", [] { return Structure(); }, recordProgress, true, false, false, false,
         "1/1 RenderEnd\n", "TarvexRenderer::Render : the renderer has no product structure\n",
         false},
        {"no scene builder", [] { return plate(); }, recordProgress, false, false, false, true,
         "0/2 RenderInit\n2/2 RenderEnd\n",
         "TarvexRenderer::Render : the renderer has no scene builder, so nothing is drawn\n", true},
    };
    for (FrameCase const& c : cases) {
        SCOPED_TRACE(c.name);
        RenderScene scene;
        Structure const structure = c.structure();
        BrepTestModeler modeler;
        modeler.outcome = Outcome::Throw;
        TarvexRendererProbe renderer(structure.get(), c.builder ? &scene.builder : nullptr,
                                     c.throwingModeler ? &modeler : nullptr);
        renderer.SetProgressCallback(c.callback);
        progressText().clear();
        std::ostringstream dbg;
        std::streambuf* const previous = KolbaVizCore::dbg.rdbuf(dbg.rdbuf());
        std::string thrown;
        {
            KolbaVizCore::ScopedAllowThrow const allow(c.allowThrow);
            try {
                EXPECT_EQ(renderer.Render(), c.result);
            } catch (std::runtime_error const& e) {
                thrown = e.what() + std::string("\n");
            }
        }
        KolbaVizCore::dbg.rdbuf(previous);
        EXPECT_EQ(progressText(), c.progress);
        EXPECT_EQ(dbg.str(), c.dbg);
        EXPECT_EQ(thrown, c.allowThrow ? c.dbg : "") << "the host gets it after RenderEnd";
        EXPECT_EQ(scene.builder.GetOpenLevelCount(), 0) << "the contexts closed on the way out";
        EXPECT_EQ(TestBrepRenderer::live(), 0);

        // The lock is free again: another thread renders through the same renderer.
        renderer.SetProgressCallback(nullptr);
        bool again = !c.again;
        std::thread([&] { again = renderer.Render(); }).join();
        EXPECT_EQ(again, c.again);
    }
    EXPECT_EQ(TarvexRenderer::MakeRenderer(nullptr, nullptr, nullptr, 0, 0, 0), nullptr);
}

TEST(TarvexRendererFrame, RecordsWhatItDrewRendersAgainFromTheRecordsAndClearsIt) {
    RenderScene scene;
    Structure const structure = plate();
    auto renderer = std::make_unique<TarvexRendererProbe>(structure.get(), &scene.builder, nullptr);
    renderer->ClearAll();
    EXPECT_EQ(scene.builder.GetSceneCount(), 0u) << "a renderer that never drew touches nothing";

    ASSERT_TRUE(renderer->Render());
    // The triangles span x 10..31, y 0..1: the view gets their centre and a quarter of the
    // diagonal.
    ASSERT_EQ(scene.view.GetExtentSpheres().size(), 1u);
    auto const& sphere = scene.view.GetExtentSpheres()[0];
    EXPECT_EQ(std::vector<float>(sphere.center.begin(), sphere.center.end()),
              (std::vector<float>{20.5f, 0.5f, 0.0f}));
    EXPECT_FLOAT_EQ(sphere.radius, static_cast<float>(std::sqrt(10.5 * 10.5 + 0.5 * 0.5) / 2));
    EXPECT_FLOAT_EQ(renderer->GetGeometryRadius(), sphere.radius);
    // Entries and elements carry the path and id of their nodes.
    RenderId path;
    EntityId entity;
    VizPSEntry const& second = *structure->GetChildren()[1];
    ASSERT_TRUE(second.Get3DRenderID(path) && second.GetEntityID(entity));
    EXPECT_EQ(scene.builder.FindNode(path)->GetName(), u"P.2");
    EXPECT_EQ(entity, EntityId(path[1], KolbaVizCore::Link, 1001));
    KolbaVizCore::VizMesh const& mesh = *structure->GetVizContainer(10)->GetMeshes()[0];
    ASSERT_TRUE(mesh.Get3DRenderID(path) && mesh.GetEntityID(entity));
    EXPECT_EQ(scene.builder.FindNode(path)->GetName(), u"Mesh12");
    EXPECT_EQ(entity, EntityId(KolbaVizCore::Vis, KolbaVizCore::Body, 12));
    std::string const once = scene.builder.Dump();
    ASSERT_TRUE(renderer->Render());
    EXPECT_EQ(scene.builder.Dump(), once) << "no second drawing, no second reference";
    EXPECT_EQ(boxText(*renderer), "(10 0 0)-(31 1 0)") << "the boxes come from the records";

    std::string const root = "1 scene \"ROOT\"\n";
    renderer->ClearAll();
    EXPECT_EQ(scene.builder.Dump(), root);
    EXPECT_TRUE(renderer->GetProductRenderId().IsEmpty());
    EXPECT_EQ(boxText(*renderer), "empty");

    ASSERT_TRUE(renderer->Render());
    EXPECT_NE(scene.builder.Dump().find("{polygon#4 mode=1"), std::string::npos)
        << "item tags are never reused";
    EXPECT_TRUE(renderer->preRender()) << "it starts afresh";
    EXPECT_EQ(scene.builder.Dump(), root);
    EXPECT_EQ(renderer->GetGeometryRadius(), 0.0f);
    EXPECT_FALSE(TarvexRendererProbe(nullptr, &scene.builder, nullptr).preRender());

    ASSERT_TRUE(renderer->Render());
    renderer.reset();
    EXPECT_EQ(scene.builder.Dump(), root);
}

TEST(TarvexRendererFrame, CopiesStartUnrenderedAndExplodeFactorsActOnTheNextRender) {
    RenderScene scene;
    Structure const structure = plate(), other = plate(true);
    BrepTestModeler modeler;
    std::unique_ptr<TarvexRenderer> const original(
        TarvexRenderer::MakeRenderer(structure.get(), &modeler, &scene.builder, 0, 0, 0));
    ASSERT_TRUE(original->Render());
    std::string const drawing = scene.builder.Dump();
    TarvexRenderer copy(*original);
    EXPECT_TRUE(copy.GetProductRenderId().IsEmpty());
    copy.ClearAll();
    EXPECT_EQ(scene.builder.Dump(), drawing) << "the copy removed nothing";
    std::unique_ptr<TarvexRenderer> const assigned(
        TarvexRenderer::MakeRenderer(other.get(), nullptr, &scene.builder, 0, 0, 0));
    ASSERT_TRUE(assigned->Render());
    *assigned = *original;
    EXPECT_TRUE(assigned->GetProductRenderId().IsEmpty());
    EXPECT_EQ(scene.builder.Dump(), drawing) << "the other product's node is gone";

    original->ExplodeView(1, 0, 0);
    EXPECT_EQ(boxText(*original), "(10 0 0)-(31 1 0)");
    original->ClearAll();
    ASSERT_TRUE(original->Render());
    // Each box moves by its placed centre along x: Q.1's (30..31, centre 30.5) to 60.5..61.5.
    EXPECT_EQ(boxText(*original), "(20.5 0 0)-(61.5 1 0)");
}

TEST(TarvexRendererFrame, ModelerRenderersAreKeptWhenTheyDrewAndFreedOtherwise) {
    struct Case {
        Outcome outcome;
        std::size_t kept;
        int created; ///< a failed renderer is tried again by the next instance
    };
    for (Case const c : {Case{Outcome::Draw, 2, 2}, Case{Outcome::Fail, 0, 3}}) {
        SCOPED_TRACE(c.kept);
        RenderScene scene;
        Structure const structure = brepPlate();
        BrepTestModeler modeler;
        modeler.outcome = c.outcome;
        int created = 0;
        modeler.created = &created;
        TestBrepRenderer::cleared() = 0;
        {
            TarvexRendererProbe renderer(structure.get(), &scene.builder, &modeler);
            ASSERT_TRUE(renderer.Render());
            EXPECT_EQ(renderer.brepRendererCount(), c.kept);
            EXPECT_EQ(TestBrepRenderer::live(), static_cast<int>(c.kept));
            EXPECT_EQ(created, c.created);
        }
        EXPECT_EQ(TestBrepRenderer::live(), 0);
        EXPECT_EQ(TestBrepRenderer::cleared(), created) << "each was cleared before it went";
        EXPECT_EQ(scene.builder.Dump(), "1 scene \"ROOT\"\n");
    }
}

#include "support/BrepTestModeler.h"
#include "support/BuildStructure.h"
#include "support/RenderFixture.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/kolba/Dbg.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/render/TarvexRenderer.h>

#include <gtest/gtest.h>

#include <cmath>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

using namespace VizBridgeTarvex;
using KolbaVizCore::Node;
using KolbaVizCore::ScopedAllowThrow;

namespace {

using Peer = VizProductStructureTestPeer;

/// Fails the walk at its first part, as a broken host callback would.
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

/// Sends KolbaVizCore::dbg into a string while it lives.
class DbgCapture {
public:
    DbgCapture() : m_previous(KolbaVizCore::dbg.rdbuf(m_text.rdbuf())) {}
    ~DbgCapture() { KolbaVizCore::dbg.rdbuf(m_previous); }
    std::string text() const { return m_text.str(); }

private:
    std::ostringstream m_text;
    std::streambuf* m_previous;
};

/// Two parts, each with a mesh container: P (1) at x = 0 and 10, Q (2) at x = 20.
std::unique_ptr<VizProductStructure> twoParts() {
    TarvexModel model;
    model.SetProductName(u"Frame");
    model.AddPart(1, u"P");
    model.AddPart(2, u"Q");
    model.AddRootInstance(1, u"P.1");
    model.AddRootInstance(1, u"P.2").placement =
        TarvexPlacement{{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}, {10, 0, 0}};
    model.AddRootInstance(2, u"Q.1").placement =
        TarvexPlacement{{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}, {20, 0, 0}};
    auto structure = buildStructure(model);
    Peer::addVizContainer(*structure, 1, makeMeshContainer(1, 11, 0));
    Peer::addVizContainer(*structure, 2, makeMeshContainer(2, 12, 0));
    return structure;
}

class TarvexRendererFrame : public ::testing::Test {
protected:
    TarvexRendererFrame() { progress().clear(); }
    RenderScene scene;
    std::unique_ptr<VizProductStructure> structure = twoParts();
};

} // namespace

TEST_F(TarvexRendererFrame, RenderHandsTheViewTheCentreAndAQuarterOfTheDiagonal) {
    std::unique_ptr<TarvexRenderer> renderer(
        TarvexRenderer::MakeRenderer(structure.get(), nullptr, &scene.builder, 0, 0, 0));
    ASSERT_TRUE(renderer->Render());
    // The triangles span x 0..21, y 0..1, z 0.
    ASSERT_EQ(scene.view.GetExtentSpheres().size(), 1u);
    auto const& sphere = scene.view.GetExtentSpheres()[0];
    EXPECT_FLOAT_EQ(sphere.center[0], 10.5f);
    EXPECT_FLOAT_EQ(sphere.center[1], 0.5f);
    float const radius = static_cast<float>(std::sqrt(10.5 * 10.5 + 0.5 * 0.5)) / 2.0f;
    EXPECT_FLOAT_EQ(sphere.radius, radius);
    EXPECT_FLOAT_EQ(renderer->GetGeometryRadius(), radius);
}

TEST_F(TarvexRendererFrame, AnEmptyProductReportsZeroThenOneOfOne) {
    TarvexModel model;
    auto empty = buildStructure(model);
    TarvexRendererProbe renderer(empty.get(), &scene.builder, nullptr);
    renderer.SetProgressCallback(recordProgress);
    ASSERT_TRUE(renderer.Render());
    ASSERT_EQ(progress().size(), 2u);
    EXPECT_EQ(progress()[0].phase, "RenderInit");
    EXPECT_EQ(progress()[0].done, 0);
    EXPECT_EQ(progress()[0].total, 0);
    EXPECT_EQ(progress()[1].phase, "RenderEnd");
    EXPECT_EQ(progress()[1].done, 1);
    EXPECT_EQ(progress()[1].total, 1);
    EXPECT_TRUE(scene.view.GetExtentSpheres().empty()) << "no box, no extents";
    EXPECT_EQ(scene.builder.GetNodeCount(), 2u) << "ROOT and the product node";
}

TEST_F(TarvexRendererFrame, AFailedWalkReportsOnDbgEndsTheProgressAndFreesTheLock) {
    struct Case {
        KolbaVizCore::ARenderer::ProgressCallback callback;
        char const* text;
    };
    for (Case const c :
         {Case{throwAtFirstPart, "TarvexRenderer::Render : walk broke\n"},
          Case{throwSomethingElse, "TarvexRenderer::Render : Unhandled Exception\n"}}) {
        SCOPED_TRACE(c.text);
        progress().clear();
        TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
        renderer.SetProgressCallback(c.callback);
        DbgCapture dbg;
        EXPECT_FALSE(renderer.Render());
        EXPECT_EQ(dbg.text(), c.text);
        ASSERT_FALSE(progress().empty());
        EXPECT_EQ(progress().back().phase, "RenderEnd");
        EXPECT_EQ(progress().back().done, 2);
        EXPECT_FALSE(renderer.GetProductRenderId().IsEmpty()) << "what was built stays";

        // The lock is free: another thread renders through the same renderer.
        renderer.SetProgressCallback(nullptr);
        renderer.ClearAll();
        bool rendered = false;
        std::thread([&] { rendered = renderer.Render(); }).join();
        EXPECT_TRUE(rendered);
    }
}

TEST_F(TarvexRendererFrame, WithTheThrowSwitchOnTheFailureReachesTheHostAfterRenderEnd) {
    ScopedAllowThrow const allow(true);
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    renderer.SetProgressCallback(throwAtFirstPart);
    DbgCapture dbg;
    try {
        renderer.Render();
        ADD_FAILURE() << "no exception";
    } catch (std::exception const& e) {
        EXPECT_STREQ(e.what(), "TarvexRenderer::Render : walk broke");
    }
    EXPECT_EQ(progress().back().phase, "RenderEnd");
    EXPECT_EQ(dbg.text(), "TarvexRenderer::Render : walk broke\n");
    EXPECT_EQ(scene.builder.GetOpenLevelCount(), 0) << "the contexts closed on the way out";
}

TEST_F(TarvexRendererFrame, ClearAllAndDeletionRemoveWhatWasDrawn) {
    auto renderer = std::make_unique<TarvexRendererProbe>(structure.get(), &scene.builder, nullptr);
    renderer->ClearAll();
    EXPECT_EQ(scene.builder.GetSceneCount(), 0u)
        << "a renderer that never rendered touches nothing";

    ASSERT_TRUE(renderer->Render());
    EXPECT_GT(scene.builder.GetNodeCount(), 2u);
    renderer->ClearAll();
    EXPECT_EQ(scene.builder.GetNodeCount(), 1u) << "ROOT stays";
    EXPECT_TRUE(renderer->GetProductRenderId().IsEmpty());
    EXPECT_TRUE(renderer->linkMap().empty());
    float box[6];
    renderer->GetGeometryBox(box);
    EXPECT_GT(box[0], box[3]);

    ASSERT_TRUE(renderer->Render());
    EXPECT_GT(scene.builder.GetNodeCount(), 2u);
    renderer.reset();
    EXPECT_EQ(scene.builder.GetNodeCount(), 1u);
}

TEST_F(TarvexRendererFrame, ASecondRenderWithoutClearingReusesTheDrawing) {
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    ASSERT_TRUE(renderer.Render());
    std::string const first = scene.builder.Dump();
    std::size_t const nodes = scene.builder.GetNodeCount();
    ASSERT_TRUE(renderer.Render());
    EXPECT_EQ(scene.builder.Dump(), first) << "no second drawing, no second reference";
    EXPECT_EQ(scene.builder.GetNodeCount(), nodes);
    float box[6];
    renderer.GetGeometryBox(box);
    EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{0, 0, 0, 21, 1, 0}))
        << "the boxes come from the records";
}

TEST_F(TarvexRendererFrame, PreRenderRefusesANullStructureAndOtherwiseStartsAfresh) {
    TarvexRendererProbe none(nullptr, &scene.builder, nullptr);
    EXPECT_FALSE(none.preRender());
    DbgCapture dbg;
    EXPECT_FALSE(none.Render());
    EXPECT_EQ(dbg.text(), "TarvexRenderer::Render : the renderer has no product structure\n");
    EXPECT_EQ(TarvexRenderer::MakeRenderer(nullptr, nullptr, &scene.builder, 0, 0, 0), nullptr);

    TarvexRendererProbe blind(structure.get(), nullptr, nullptr);
    DbgCapture noBuilder;
    EXPECT_TRUE(blind.Render()) << "nothing refused the walk: it only had nowhere to draw";
    EXPECT_EQ(noBuilder.text(),
              "TarvexRenderer::Render : the renderer has no scene builder, so nothing is drawn\n");

    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    ASSERT_TRUE(renderer.Render());
    EXPECT_TRUE(renderer.preRender());
    EXPECT_EQ(renderer.GetGeometryRadius(), 0.0f);
    EXPECT_EQ(scene.builder.GetNodeCount(), 1u);
}

TEST_F(TarvexRendererFrame, ExplodeFactorsActOnTheBoxesOfTheNextRender) {
    BrepTestModeler modeler;
    TarvexRendererProbe renderer(structure.get(), &scene.builder, &modeler, 0, 0, 0);
    ASSERT_TRUE(renderer.Render());
    float before[6];
    renderer.GetGeometryBox(before);
    renderer.ExplodeView(1, 0, 0);
    float same[6];
    renderer.GetGeometryBox(same);
    EXPECT_EQ(std::vector<float>(same, same + 6), std::vector<float>(before, before + 6));

    renderer.ClearAll();
    ASSERT_TRUE(renderer.Render());
    float after[6];
    renderer.GetGeometryBox(after);
    // Q.1's box (x 20..21, centre 20.5) is pushed another 20.5 out along x.
    EXPECT_FLOAT_EQ(after[3], 41.5f);
    EXPECT_FLOAT_EQ(after[4], before[4]);
}

TEST_F(TarvexRendererFrame, ModelerRenderersAreKeptWhenTheyDrewAndFreedOtherwise) {
    TarvexModel model;
    model.AddPart(1, u"Good");
    model.AddPart(2, u"Bad");
    model.AddRootInstance(1, u"Good.1");
    model.AddRootInstance(1, u"Good.2");
    model.AddRootInstance(2, u"Bad.1");
    auto parts = buildStructure(model);
    Peer::addPartContainer(*parts, 1, new TestPartContainer(u"Good", 1));
    Peer::addPartContainer(*parts, 2, new TestPartContainer(u"Bad", 2));

    struct Case {
        TestBrepRenderer::Outcome outcome;
        std::size_t kept;
        bool referenced;
    };
    for (Case const c : {Case{TestBrepRenderer::Outcome::Draw, 2, true},
                         Case{TestBrepRenderer::Outcome::Fail, 0, false}}) {
        BrepTestModeler modeler;
        modeler.outcome = c.outcome;
        int created = 0;
        modeler.created = &created;
        TestBrepRenderer::cleared() = 0;
        {
            // Failed renderers are cleared at once, kept ones when the renderer goes.
            TarvexRendererProbe renderer(parts.get(), &scene.builder, &modeler);
            ASSERT_TRUE(renderer.Render());
            EXPECT_EQ(renderer.brepRendererCount(), c.kept);
            EXPECT_EQ(TestBrepRenderer::live(), static_cast<int>(c.kept));
            // A failed renderer is tried again by the next instance, and freed each time.
            EXPECT_EQ(created, c.referenced ? 2 : 3);
            std::uint32_t const T = renderer.GetProductRenderId()[1];
            Node const* second = scene.builder.FindNode(pathOf({1, T, 1001}));
            EXPECT_EQ(second->GetReferenceCount(), c.referenced ? 1u : 0u);
        }
        EXPECT_EQ(TestBrepRenderer::live(), 0);
        EXPECT_EQ(TestBrepRenderer::cleared(), created)
            << "every renderer was cleared before it went";
        EXPECT_EQ(scene.builder.GetNodeCount(), 1u);
    }
}

TEST_F(TarvexRendererFrame, AModelerRendererThatThrowsIsFreedAndTheRenderFails) {
    Peer::addPartContainer(*structure, 1, new TestPartContainer(u"P", 1));
    BrepTestModeler modeler;
    modeler.outcome = TestBrepRenderer::Outcome::Throw;
    TarvexRendererProbe renderer(structure.get(), &scene.builder, &modeler);
    DbgCapture dbg;
    EXPECT_FALSE(renderer.Render());
    EXPECT_EQ(dbg.text(), "TarvexRenderer::Render : modeler renderer broke\n");
    EXPECT_EQ(TestBrepRenderer::live(), 0);
}

TEST_F(TarvexRendererFrame, ACopyStartsUnrenderedWithItsOwnServicesAndLock) {
    BrepTestModeler modeler;
    TarvexRendererProbe original(structure.get(), &scene.builder, &modeler, 2, 0, 0);
    ASSERT_TRUE(original.Render());
    TarvexRendererProbe copy(original);
    EXPECT_TRUE(copy.GetProductRenderId().IsEmpty());
    EXPECT_TRUE(copy.linkMap().empty());
    copy.ClearAll();
    EXPECT_FALSE(original.GetProductRenderId().IsEmpty()) << "the copy removed nothing";
    EXPECT_NE(scene.builder.FindNode(original.GetProductRenderId()), nullptr);
}

#include <VizBridge/contracts/kolba/ARenderer.h>

#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/RecordingView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>

#include "SceneTestScene.h"

#include <gtest/gtest.h>

#include <memory>

using namespace KolbaVizCore;

namespace {

/// The least renderer: draws one triangle below the current node and remembers its path.
class TriangleRenderer : public ARenderer {
public:
    using ARenderer::ARenderer;

    bool Render() override {
        SceneBuilder* const builder = getSceneBuilder();
        if (builder == nullptr)
            return false;
        RenderId here;
        if (!builder->GetCurrentRenderId(here))
            return false;
        setRenderId(here);
        SceneTest::addTriangle(*builder, 0, 0.0f);
        addToReport(u"triangle drawn");
        return true;
    }
    void ClearAll() override { renderId().Clear(); }
    bool Convert(RenderId const&, EntityId&) override { return false; }
    bool Convert(EntityId const&, RenderId&) override { return false; }
    bool ConvertToHighlight(RenderId const&, RenderId*&, int&) override { return false; }
    void GetGeometryCenter(float* const) const override {}
    float GetGeometryRadius() const override { return 0.0f; }
    void GetGeometryBox(float* const) const override {}

    AGeometryItemFactory* factory() const { return getGeometryItemFactory(); }
    AView3DAdapter* adapter() const { return getView3DAdapter(); }

protected:
    bool preRender() override { return true; }
    void postRender() override {}
};

/// Tells when it is destroyed.
class WatchedBuilder : public SceneBuilder {
public:
    explicit WatchedBuilder(bool& destroyed) : m_destroyed(destroyed) {}
    ~WatchedBuilder() override { m_destroyed = true; }

private:
    bool& m_destroyed;
};

} // namespace

TEST(ARenderer, DeletesTheBuilderOnlyWhenItOwnsIt) {
    struct Case {
        char const* name;
        bool owns;
        bool copy;
    } const cases[] = {
        {"not owned by default", false, false},
        {"owned", true, false},
        {"a copy of an owner does not own", true, true},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        bool destroyed = false;
        // Owned by the renderer in the owning cases: released here so that it is deleted once.
        auto builder = std::make_unique<WatchedBuilder>(destroyed);
        {
            auto renderer = std::make_unique<TriangleRenderer>(builder.get(), nullptr);
            renderer->SetBuilderOwnership(c.owns);
            EXPECT_EQ(renderer->GetBuilderOwnership(), c.owns);
            if (c.copy) {
                TriangleRenderer const copy(*renderer);
                EXPECT_FALSE(copy.GetBuilderOwnership());
            }
            EXPECT_FALSE(destroyed) << "no copy deletes the builder";
            if (c.owns)
                static_cast<void>(builder.release());
        }
        EXPECT_EQ(destroyed, c.owns);
    }
}

TEST(ARenderer, ReachesTheBuildersFactoryAndViewOrNothing) {
    TriangleRenderer const withoutBuilder(nullptr, nullptr);
    EXPECT_EQ(withoutBuilder.factory(), nullptr);
    EXPECT_EQ(withoutBuilder.adapter(), nullptr);

    RecordingView3D view;
    SceneBuilder builder;
    View3DAdapter adapter(&view, &builder);
    builder.SetView3DAdapter(&adapter);
    TriangleRenderer renderer(&builder, nullptr);
    EXPECT_EQ(renderer.factory(), builder.GetGeometryItemFactory());
    EXPECT_EQ(renderer.adapter(), &adapter);
    builder.SetGeometryItemFactory(nullptr);
    EXPECT_EQ(renderer.factory(), nullptr);

    RenderId id;
    EXPECT_FALSE(renderer.Activate(id));
    EXPECT_TRUE(renderer.GetToolTip(id).empty());
    EXPECT_EQ(renderer.GetProgressCallback(), nullptr);
}

TEST(ARenderer, ReportsOnlyInReportModeOwnOrInheritedFromItsProvider) {
    SceneBuilder builder;
    SceneContext scene(&builder, Node::RootNodeId, u"ROOT");
    TriangleRenderer owner(&builder, nullptr);
    TriangleRenderer sub(&builder, &owner);

    ASSERT_TRUE(sub.Render());
    EXPECT_TRUE(sub.GetReport().empty());
    owner.SetReportMode(true);
    EXPECT_TRUE(sub.GetReportMode());
    ASSERT_TRUE(sub.Render());
    EXPECT_EQ(sub.GetReport(), u"triangle drawn\n");
    EXPECT_TRUE(owner.GetReport().empty()) << "each renderer keeps its own text";
    sub.ClearReport();
    EXPECT_TRUE(sub.GetReport().empty());
    EXPECT_EQ(sub.GetRenderId().GetTags(), (std::vector<std::uint32_t>{Node::RootNodeId}));
}

TEST(View3DAdapter, PicksInItsSceneAndGivesItsView) {
    RecordingView3D view;
    SceneBuilder builder;
    SceneTest::buildTwoInstances(builder);
    View3DAdapter adapter(&view, &builder);
    EXPECT_EQ(adapter.GetView3D(), &view);

    Ray ray;
    ray.origin[0] = 20.2;
    ray.origin[1] = 0.2;
    ray.origin[2] = 1.0;
    ray.direction[2] = -1.0;
    RenderId hit;
    ASSERT_TRUE(adapter.PickRenderId(ray, hit));
    EXPECT_EQ(hit.Length(), 6);
    EXPECT_EQ(hit[2], 1001u);
    View3DAdapter blind(nullptr, nullptr);
    EXPECT_FALSE(blind.PickRenderId(ray, hit));
    EXPECT_EQ(blind.GetView3D(), nullptr);

    float const center[3] = {1, 2, 3};
    IView3D& asView = view;
    asView.SetGeometryExtents(center, 4.0f);
    double const low[3] = {0, 0, 0};
    double const high[3] = {1, 2, 3};
    asView.SetGeometryExtents(VizBox(low, high));
    asView.SetViewOption(1);
    ASSERT_EQ(view.GetExtentSpheres().size(), 1u);
    EXPECT_EQ(view.GetExtentSpheres()[0].center[2], 3.0f);
    EXPECT_EQ(view.GetExtentSpheres()[0].radius, 4.0f);
    ASSERT_EQ(view.GetExtentBoxes().size(), 1u);
    EXPECT_EQ(view.GetExtentBoxes()[0], VizBox(low, high));
    EXPECT_EQ(view.GetViewOptions(), std::vector<int>{1});
    view.Clear();
    EXPECT_TRUE(view.GetViewOptions().empty());
}

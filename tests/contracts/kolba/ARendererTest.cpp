#include <VizBridge/contracts/kolba/ARenderer.h>

#include <VizBridge/contracts/kolba/SceneBuilder.h>

#include <gtest/gtest.h>

#include <memory>

using namespace KolbaVizCore;

namespace {

/// The least renderer, with the base's protected helpers opened up.
class LeastRenderer : public ARenderer {
public:
    using ARenderer::ARenderer;
    bool Render() override { return true; }
    void ClearAll() override {}
    bool Convert(RenderId const&, EntityId&) override { return false; }
    bool Convert(EntityId const&, RenderId&) override { return false; }
    bool ConvertToHighlight(RenderId const&, RenderId*&, int&) override { return false; }
    void GetGeometryCenter(float* const) const override {}
    float GetGeometryRadius() const override { return 0.0f; }
    void GetGeometryBox(float* const) const override {}
    bool preRender() override { return true; }
    void postRender() override {}
    void report(VizPort::WString const& line) { addToReport(line); }
};

/// Tells when it is destroyed.
struct WatchedBuilder : SceneBuilder {
    explicit WatchedBuilder(bool& destroyed) : destroyed(destroyed) {}
    ~WatchedBuilder() override { destroyed = true; }
    bool& destroyed;
};

} // namespace

TEST(ARenderer, DeletesTheBuilderOnlyWhenItOwnsItAndNoCopyOwnsIt) {
    for (bool const owns : {false, true}) {
        bool destroyed = false;
        auto builder = std::make_unique<WatchedBuilder>(destroyed);
        {
            LeastRenderer renderer(builder.get(), nullptr);
            EXPECT_FALSE(renderer.GetBuilderOwnership()) << "not owned by default";
            renderer.SetBuilderOwnership(owns);
            if (owns)
                static_cast<void>(builder.release()); // the renderer's from here
            LeastRenderer const copy(renderer);       // deleting it too would free it twice
            EXPECT_FALSE(copy.GetBuilderOwnership());
        }
        EXPECT_EQ(destroyed, owns);
    }
    bool destroyed = false;
    LeastRenderer owner(std::make_unique<WatchedBuilder>(destroyed).release(), nullptr);
    owner.SetBuilderOwnership(true);
    owner = LeastRenderer(nullptr, nullptr);
    EXPECT_TRUE(destroyed) << "an owner assigned over lets go of its builder";
}

TEST(ARenderer, ReportsOnlyInItsOwnOrItsProvidersReportMode) {
    LeastRenderer owner(nullptr, nullptr);
    LeastRenderer sub(nullptr, &owner);
    sub.report(u"dropped");
    EXPECT_EQ(sub.GetReport(), u"") << "not in report mode";
    owner.SetReportMode(true);
    sub.report(u"one");
    sub.report(u"two");
    EXPECT_EQ(sub.GetReport(), u"one\ntwo\n");
    EXPECT_EQ(owner.GetReport(), u"") << "each renderer keeps its own text";
}

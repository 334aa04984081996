#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

#include "SceneTestScene.h"
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/EntityContext.h>

#include <gtest/gtest.h>

#include <stdexcept>

using namespace KolbaVizCore;
using SceneTest::pathOf;

namespace {

constexpr std::uint32_t R = Node::RootNodeId;

/// Opens ROOT / Part (10007) / Geometry (10006) / Mesh12 / one face entity, each level only
/// below an OK one, as renderers do; answers how many levels opened.
int openNestedLevels(SceneBuilder& builder) {
    int opened = 0;
    ConstructionContext construction(&builder);
    if (!construction.IsOK())
        return opened;
    SceneContext scene(&builder, R, u"ROOT");
    if (!scene.IsOK())
        return opened;
    ++opened;
    SceneLevelContext part(&builder, Group, u"Part");
    if (!part.IsOK())
        return opened;
    ++opened;
    EntityTypeContext geometry(&builder, Vis, u"Geometry");
    if (!geometry.IsOK())
        return opened;
    ++opened;
    BodyContext body(&builder, 12, u"Mesh12");
    if (!body.IsOK())
        return opened;
    ++opened;
    EntityContext face(&builder, 1, u"MeshGeometry", false, RGBAColor());
    return face.IsOK() ? opened + 1 : opened;
}

} // namespace

TEST(SceneBuilderContext, ClosesItsLevelWhenAnExceptionPassesThrough) {
    SceneBuilder builder;
    try {
        ConstructionContext construction(&builder);
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext level(&builder, 5, u"level");
        EXPECT_TRUE(builder.IsConstructing());
        EXPECT_EQ(builder.GetOpenLevelCount(), 2);
        throw std::runtime_error("walk failed");
    } catch (std::runtime_error const&) {
    }
    EXPECT_FALSE(builder.IsConstructing());
    EXPECT_EQ(builder.GetOpenLevelCount(), 0);
    RenderId current;
    EXPECT_FALSE(builder.GetCurrentRenderId(current));
    EXPECT_NE(builder.FindNode(pathOf({R, 5})), nullptr) << "closing keeps what was built";
}

TEST(SceneBuilderContext, AFaultPlanRefusesTheChosenContextAndWhatStandsBelowIt) {
    struct Case {
        char const* name;
        void (*plan)(SceneBuilder&);
        int opened;
    } const cases[] = {
        {"nothing refused", [](SceneBuilder&) {}, 5},
        {"by name", [](SceneBuilder& b) { b.FailContextsNamed(u"Part"); }, 1},
        {"by tag", [](SceneBuilder& b) { b.FailContextsTagged(12); }, 3},
        {"by kind", [](SceneBuilder& b) { b.FailContextsOfKind(ContextKind::Entity); }, 4},
        {"the construction",
         [](SceneBuilder& b) { b.FailContextsOfKind(ContextKind::Construction); }, 0},
        {"the scene top", [](SceneBuilder& b) { b.FailContextsOfKind(ContextKind::Scene); }, 0},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        SceneBuilder builder;
        c.plan(builder);
        EXPECT_EQ(openNestedLevels(builder), c.opened);
        EXPECT_EQ(builder.GetRefusedContextCount(), c.opened == 5 ? 0 : 1);
        EXPECT_EQ(builder.GetOpenLevelCount(), 0);
        EXPECT_FALSE(builder.IsConstructing());
        EXPECT_EQ(builder.GetNodeCount(), static_cast<std::size_t>(c.opened));

        builder.ClearContextFaults();
        EXPECT_EQ(openNestedLevels(builder), 5) << "the plan holds until cleared";
    }
}

TEST(SceneBuilderContext, IsNotOKWithoutABuilderOrAParentNode) {
    SceneLevelContext withoutBuilder(nullptr, 1, u"level");
    EXPECT_FALSE(withoutBuilder.IsOK());
    ConstructionContext constructionWithoutBuilder(nullptr);
    EXPECT_FALSE(constructionWithoutBuilder.IsOK());

    SceneBuilder builder;
    {
        ConstructionContext construction(&builder);
        ASSERT_TRUE(construction.IsOK());
        ContainerContext outsideAScene(&builder, 2, u"product", 1);
        EXPECT_FALSE(outsideAScene.IsOK()) << "only a scene context opens at the top";
        EntityContext entity(&builder, 3, u"entity", true, RGBAColor(1, 2, 3, 4));
        EXPECT_FALSE(entity.IsOK());
    }
    EXPECT_EQ(builder.GetNodeCount(), 0u);
    EXPECT_EQ(builder.GetRefusedContextCount(), 0) << "no parent is no fault of the plan";
}

TEST(SceneBuilderContext, AnEntityTakesItsColourOnlyWhenAskedTo) {
    SceneBuilder builder;
    SceneContext scene(&builder, R, u"ROOT");
    {
        EntityContext colored(&builder, 1, u"MeshGeometry", true, RGBAColor(10, 20, 30, 128));
        ASSERT_TRUE(colored.IsOK());
    }
    EntityContext plain(&builder, 2, u"MeshGeometry", false, RGBAColor(10, 20, 30, 128));
    Node const* const coloredNode = builder.FindNode(pathOf({R, 1}));
    ASSERT_NE(coloredNode, nullptr);
    EXPECT_TRUE(coloredNode->HasOwnColor());
    EXPECT_FALSE(coloredNode->IsColorOverride());
    EXPECT_EQ(coloredNode->GetColor(), RGBAColor(10, 20, 30, 128));
    EXPECT_FALSE(builder.FindNode(pathOf({R, 2}))->HasOwnColor());
}

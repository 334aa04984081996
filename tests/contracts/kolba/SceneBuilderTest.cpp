#include <VizBridge/contracts/kolba/SceneBuilder.h>

#include "SceneTestScene.h"
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <thread>
#include <vector>

using namespace KolbaVizCore;
using SceneTest::buildTwoInstances;
using SceneTest::pathOf;
using SceneTest::ProductTag;

namespace {

constexpr std::uint32_t R = Node::RootNodeId;

Ray downwardRayAt(double x, double y) {
    Ray ray;
    ray.origin[0] = x;
    ray.origin[1] = y;
    ray.origin[2] = 10.0;
    ray.direction[2] = -2.0; // not of unit length: the distance is still in scene units
    return ray;
}

} // namespace

TEST(SceneBuilder, ContextsGivePathsFromTheSceneTopAndCloseBackToNothing) {
    SceneBuilder builder;
    RenderId untouched(7);
    untouched.AddValue(99);
    RenderId id = untouched;
    EXPECT_FALSE(builder.GetCurrentRenderId(id));
    EXPECT_EQ(id.GetTags(), untouched.GetTags());
    {
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, ProductTag, u"Plate", 1);
        SceneLevelContext instance(&builder, 1000, u"P.1");
        ASSERT_TRUE(builder.GetCurrentRenderId(id));
        EXPECT_EQ(id.GetLeading(), 1u);
        EXPECT_EQ(id.GetTags(), (std::vector<std::uint32_t>{R, ProductTag, 1000}));
        EXPECT_EQ(builder.GetOpenLevelCount(), 3);
    }
    EXPECT_EQ(builder.GetOpenLevelCount(), 0);
    EXPECT_FALSE(builder.GetCurrentRenderId(id));

    Node const* const product = builder.FindNode(pathOf({R, ProductTag}));
    ASSERT_NE(product, nullptr);
    EXPECT_EQ(product->GetKind(), ContextKind::Container);
    EXPECT_EQ(product->GetContainerType(), 1u);
    EXPECT_EQ(product->GetName(), u"Plate");
    EXPECT_EQ(product->GetParent(), builder.GetScene(0));
    EXPECT_EQ(builder.GetScene(0)->GetParent(), nullptr);
    EXPECT_EQ(product->FindChild(1000)->GetPath().GetTags(),
              (std::vector<std::uint32_t>{R, ProductTag, 1000}));
    EXPECT_EQ(builder.FindNode(pathOf({R, 5})), nullptr);
    EXPECT_EQ(builder.FindNode(RenderId(1)), nullptr);
}

TEST(SceneBuilder, ASecondRenderReusesItsNodesWhileEntitiesAlwaysGetNewOnes) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    std::string const first = builder.Dump();
    std::size_t const nodes = builder.GetNodeCount();
    {
        // The same levels again: only the item is added a second time.
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, ProductTag, u"renamed", 1);
        SceneLevelContext instance(&builder, 1001, u"P.2");
        EXPECT_TRUE(builder.AddNodeReference(pathOf({R, ProductTag, 1000, Group})));
    }
    EXPECT_EQ(builder.GetNodeCount(), nodes);
    EXPECT_EQ(builder.Dump(), first) << "a reused node keeps its name, a reference is not doubled";

    SceneContext scene(&builder, R, u"ROOT");
    EntityTypeContext faces(&builder, Face, u"MeshFaces");
    for (int face = 0; face < 3; ++face)
        EntityContext entity(&builder, 1, u"MeshGeometry", false, RGBAColor());
    Node const* const typeNode = builder.FindNode(pathOf({R, Face}));
    ASSERT_NE(typeNode, nullptr);
    EXPECT_EQ(typeNode->GetChildCount(), 3u);
    EXPECT_EQ(builder.FindNode(pathOf({R, Face, 1})), typeNode->GetChild(0));
}

TEST(SceneBuilder, DumpsTheSceneAsStableText) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    EXPECT_EQ(builder.Dump(), "1 scene \"ROOT\"\n"
                              "  77 container(1) \"Plate\"\n"
                              "    1000 level \"P.1\" T=[1 0 0 10; 0 1 0 0; 0 0 1 0]\n"
                              "      10007 level \"Part\"\n"
                              "        10006 type \"Geometry\"\n"
                              "          12 body \"Mesh12\" {polygon#0 mode=1 n=3}\n"
                              "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
                              "      -> ref 1/77/1000/10007\n");

    SceneBuilder styled;
    {
        SceneContext scene(&styled, R, u"ROOT");
        styled.SetCurrentColor(RGBAColor(255, 0, 0, 255), true);
        SceneLevelContext plane(&styled, 41, u"Plane Rectangle");
        styled.SetLineStyle("dashed", -1.0f);
        styled.SetVisibility(false);
        float const square[15] = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0, 0, 0, 0};
        GeometryItem* const line = styled.GetGeometryItemFactory()->MakePolyline(3, square, 15);
        line->SetColor(RGBAColor(255, 255, 255, 255));
        styled.AddGeometryItem(line);
        styled.AddGeometryItem(styled.GetGeometryItemFactory()->MakePoint(4, 0.5f, -1, 2));
        EntityContext edge(&styled, 9, u"PMI Edge", true, RGBAColor(0, 128, 0, 200));
    }
    EXPECT_EQ(styled.Dump(), "1 scene \"ROOT\" color=255,0,0,255 override\n"
                             "  41 level \"Plane Rectangle\" hidden line=dashed/-1 "
                             "{polyline#3 pts=5 c=255,255,255,255; point#4 at=0.5,-1,2}\n"
                             "    9 entity \"PMI Edge\" color=0,128,0,200\n");
}

TEST(SceneBuilder, AReferenceSharesTheSubtreeAndComposesPlacements) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    RenderId const throughReference = pathOf({R, ProductTag, 1001, Group, Vis, 12});
    Node const* const shared = builder.FindNode(pathOf({R, ProductTag, 1000, Group}));
    ASSERT_NE(shared, nullptr);
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1001, Group})), shared);
    EXPECT_EQ(shared->GetReferrerCount(), 1u);
    EXPECT_EQ(builder.GetNodeCount(), 7u) << "the reference copies nothing";

    Matrix4 world;
    ASSERT_TRUE(builder.GetWorldTransform(throughReference, world));
    EXPECT_EQ(world.At(0, 3), 20.0);
    ASSERT_TRUE(builder.GetWorldTransform(pathOf({R, ProductTag, 1000, Group, Vis, 12}), world));
    EXPECT_EQ(world.At(0, 3), 10.0);

    VizBox box;
    ASSERT_TRUE(builder.GetWorldBox(pathOf({R, ProductTag}), box));
    EXPECT_EQ(box.GetLow()[0], 10.0);
    EXPECT_EQ(box.GetHigh()[0], 21.0);
}

TEST(SceneBuilder, RefusesReferencesThatWouldShowANodeBelowItself) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    SceneContext scene(&builder, R, u"ROOT");
    ContainerContext product(&builder, ProductTag, u"Plate", 1);
    SceneLevelContext first(&builder, 1000, u"P.1");
    SceneLevelContext part(&builder, Group, u"Part");
    EXPECT_FALSE(builder.AddNodeReference(pathOf({R, ProductTag, 1000, Group}))) << "itself";
    EXPECT_FALSE(builder.AddNodeReference(pathOf({R, ProductTag}))) << "an owner";
    EXPECT_FALSE(builder.AddNodeReference(pathOf({R, ProductTag, 1001}))) << "through a referrer";
    EXPECT_FALSE(builder.AddNodeReference(pathOf({R, 4242}))) << "nothing";
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1000, Group}))->GetReferenceCount(), 0u);
}

TEST(SceneBuilder, RemovingASubtreeTakesTheReferencesToItAlong) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, ProductTag, 1000})));

    Node const* const second = builder.FindNode(pathOf({R, ProductTag, 1001}));
    ASSERT_NE(second, nullptr);
    EXPECT_EQ(second->GetReferenceCount(), 0u);
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1001, Group})), nullptr);
    EXPECT_EQ(builder.Dump().find("-> ref"), std::string::npos);
    RenderId hit;
    double distance = 0.0;
    // Would read freed nodes under the sanitizers if the reference had stayed.
    EXPECT_FALSE(builder.Pick(downwardRayAt(20.2, 0.3), hit, distance));
    EXPECT_FALSE(builder.RemoveNode(pathOf({R, ProductTag, 1000}))) << "already gone";
    EXPECT_EQ(builder.GetNodeCount(), 3u);
}

TEST(SceneBuilder, RemovingThroughAReferenceRemovesOnlyTheReference) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, ProductTag, 1001, Group})));
    Node const* const shared = builder.FindNode(pathOf({R, ProductTag, 1000, Group}));
    ASSERT_NE(shared, nullptr);
    EXPECT_EQ(shared->GetReferrerCount(), 0u);
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1001}))->GetReferenceCount(), 0u);

    // Removing a referencing node lets go of the referenced one as well.
    buildTwoInstances(builder);
    ASSERT_EQ(shared->GetReferrerCount(), 1u);
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, ProductTag, 1001})));
    EXPECT_EQ(shared->GetReferrerCount(), 0u);
}

TEST(SceneBuilder, KeepsOpenLevelsAndRefusesToRemoveThem) {
    SceneBuilder builder;
    SceneContext scene(&builder, R, u"ROOT");
    SceneLevelContext level(&builder, 5, u"open");
    EXPECT_FALSE(builder.RemoveNode(pathOf({R})));
    EXPECT_FALSE(builder.RemoveNode(pathOf({R, 5})));
    EXPECT_FALSE(builder.RemoveNode(RenderId(1)));
    EXPECT_FALSE(builder.Clear());
    EXPECT_EQ(builder.GetNodeCount(), 2u);
}

TEST(SceneBuilder, ColourAndVisibilityFollowThePath) {
    SceneBuilder builder;
    {
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext outer(&builder, 1, u"outer");
        builder.SetCurrentColor(RGBAColor(1, 1, 1, 255), true);
        SceneLevelContext inner(&builder, 2, u"inner");
        builder.SetCurrentColor(RGBAColor(2, 2, 2, 255), true);
        EntityContext own(&builder, 3, u"own", true, RGBAColor(3, 3, 3, 255));
    }
    {
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext plain(&builder, 4, u"plain");
        builder.SetVisibility(false);
        SceneLevelContext colored(&builder, 5, u"colored");
        builder.SetCurrentColor(RGBAColor(5, 5, 5, 128), false);
        SceneLevelContext below(&builder, 6, u"below");
    }
    struct Case {
        char const* name;
        RenderId path;
        bool hasColor;
        std::uint8_t colorByte;
        bool shown;
    } const cases[] = {
        {"outermost override wins", pathOf({R, 1, 2, 3}), true, 1, true},
        {"override on the node itself", pathOf({R, 1}), true, 1, true},
        {"nearest own colour below a hidden node", pathOf({R, 4, 5, 6}), true, 5, false},
        {"no colour on the way", pathOf({R, 4}), false, 0, false},
        {"scene top", pathOf({R}), false, 0, true},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        RGBAColor color(9, 9, 9, 9);
        EXPECT_EQ(builder.GetDisplayColor(c.path, color), c.hasColor);
        EXPECT_EQ(color.red, c.hasColor ? c.colorByte : 9);
        EXPECT_EQ(builder.IsShown(c.path), c.shown);
    }
}

TEST(SceneBuilder, PicksTheNearestShownTriangleThroughReferencesAndPlacements) {
    SceneBuilder builder;
    buildTwoInstances(builder);
    struct Case {
        char const* name;
        double x;
        bool hits;
        std::vector<std::uint32_t> path;
    } const cases[] = {
        {"first instance", 10.2, true, {R, ProductTag, 1000, Group, Vis, 12}},
        {"second instance, through the reference",
         20.2,
         true,
         {R, ProductTag, 1001, Group, Vis, 12}},
        {"beside both", 15.0, false, {}},
        {"outside the triangle's hypotenuse", 20.8, false, {}},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        RenderId hit(5);
        double distance = -1.0;
        EXPECT_EQ(builder.Pick(downwardRayAt(c.x, 0.3), hit, distance), c.hits);
        EXPECT_EQ(hit.GetTags(), c.path);
        EXPECT_EQ(hit.GetLeading(), c.hits ? 1u : 5u);
        EXPECT_DOUBLE_EQ(distance, c.hits ? 10.0 : -1.0);
    }

    {
        // A nearer triangle over the second instance wins; hiding it gives the far one back.
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext cover(&builder, 3000, u"cover");
        SceneTest::placeAt(builder, 20, 0, 0);
        SceneTest::addTriangle(builder, 1, 4.0f);
    }
    RenderId hit;
    double distance = 0.0;
    ASSERT_TRUE(builder.Pick(downwardRayAt(20.2, 0.3), hit, distance));
    EXPECT_EQ(hit.GetTags(), (std::vector<std::uint32_t>{R, 3000}));
    EXPECT_DOUBLE_EQ(distance, 6.0);
    {
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext cover(&builder, 3000, u"cover");
        builder.SetVisibility(false);
    }
    ASSERT_TRUE(builder.Pick(downwardRayAt(20.2, 0.3), hit, distance));
    EXPECT_EQ(hit.Length(), 6);

    Ray still = downwardRayAt(20.2, 0.3);
    still.direction[2] = 0.0;
    EXPECT_FALSE(builder.Pick(still, hit, distance)) << "a ray without direction hits nothing";
}

TEST(SceneBuilder, AnItemWithoutACurrentNodeIsDestroyedNotLost) {
    SceneBuilder builder;
    EXPECT_FALSE(builder.AddGeometryItem(builder.GetGeometryItemFactory()->MakePoint(0, 0, 0, 0)));
    EXPECT_FALSE(builder.AddGeometryItem(nullptr));
    EXPECT_EQ(builder.GetNodeCount(), 0u); // the sanitizer build reports the item if it leaked
}

TEST(SceneBuilder, ManyInstancesOfOnePartStayOneNodeEach) {
    SceneBuilder builder;
    constexpr std::uint32_t Instances = 2000;
    {
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, ProductTag, u"Many", 1);
        for (std::uint32_t index = 0; index < Instances; ++index) {
            SceneLevelContext instance(&builder, 1000 + index, u"I");
            if (index == 0) {
                SceneLevelContext part(&builder, Group, u"Part");
                SceneTest::addTriangle(builder, 0, 0.0f);
            } else {
                builder.AddNodeReference(pathOf({R, ProductTag, 1000, Group}));
            }
        }
    }
    EXPECT_EQ(builder.GetNodeCount(), Instances + 3);
    // Looking up a late tag among many children goes through the index.
    ASSERT_NE(builder.FindNode(pathOf({R, ProductTag, 1000 + Instances - 1, Group})), nullptr);
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, ProductTag, 1000})));
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1000 + Instances - 1}))->GetReferenceCount(),
              0u);
    EXPECT_EQ(builder.FindNode(pathOf({R, ProductTag, 1000})), nullptr);
}

TEST(Node, NextIdsAreFreshAndGrowOnEveryThread) {
    constexpr int Threads = 4;
    constexpr int PerThread = 1000;
    std::vector<std::vector<std::uint32_t>> drawn(Threads);
    std::vector<std::thread> workers;
    for (int thread = 0; thread < Threads; ++thread) {
        workers.emplace_back([&drawn, thread] {
            for (int i = 0; i < PerThread; ++i)
                drawn[static_cast<std::size_t>(thread)].push_back(Node::GetNextId());
        });
    }
    for (std::thread& worker : workers)
        worker.join();
    std::set<std::uint32_t> all;
    for (std::vector<std::uint32_t> const& ids : drawn) {
        EXPECT_TRUE(std::is_sorted(ids.begin(), ids.end()));
        EXPECT_EQ(std::adjacent_find(ids.begin(), ids.end()), ids.end());
        all.insert(ids.begin(), ids.end());
    }
    EXPECT_EQ(all.size(), static_cast<std::size_t>(Threads * PerThread));
    EXPECT_GE(*all.begin(), 0x01000000u) << "no generated id reads as an entity type tag";
    EXPECT_GT(Node::GetNextId(), *all.rbegin());
}

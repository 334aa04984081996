#include "support/BrepTestModeler.h"
#include "support/BuildStructure.h"
#include "support/RenderFixture.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/kolba/Dbg.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/render/SameRenderId.h>

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

using namespace VizBridgeTarvex;
using KolbaVizCore::Node;

namespace {

using Peer = VizProductStructureTestPeer;

TarvexPlacement at(double x, double y = 0, double z = 0) {
    TarvexPlacement placement;
    placement.translation[0] = x;
    placement.translation[1] = y;
    placement.translation[2] = z;
    return placement;
}

/// The product Plate: P.1 and P.2 of part P (10, mesh 12 with a wire 13), Q.1 of part Q
/// (20, mesh 14), at x = 10, 20, 30 - at the top, or inside one root assembly A (30).
std::unique_ptr<VizProductStructure> plate(bool insideAssembly) {
    TarvexModel model;
    model.SetProductName(u"Plate");
    model.AddPart(10, u"P");
    model.AddPart(20, u"Q");
    unsigned int parent = 0;
    if (insideAssembly) {
        model.AddAssembly(30, u"A");
        model.AddRootInstance(30, u"A.1");
        parent = 30;
    }
    auto place = [&](unsigned int ref, char16_t const* name, double x) {
        TarvexAuthoredInstance& instance =
            parent ? model.AddInstance(parent, ref, name) : model.AddRootInstance(ref, name);
        instance.placement = at(x);
    };
    place(10, u"P.1", 10);
    place(10, u"P.2", 20);
    place(20, u"Q.1", 30);
    std::unique_ptr<VizProductStructure> structure = buildStructure(model);
    VizContainer* p = makeMeshContainer(10, 12, 0);
    auto wire = std::make_unique<KolbaVizCore::VizWire>();
    wire->setID(13);
    wire->AddEdge(makeEdge({0, 0, 0, 0, 2, 0}));
    p->AddWire(wire.release());
    Peer::addVizContainer(*structure, 10, p);
    Peer::addVizContainer(*structure, 20, makeMeshContainer(20, 14, 0));
    return structure;
}

std::string withProductTag(std::string text, std::uint32_t tag) {
    std::string const mark = "{T}";
    for (std::size_t at = text.find(mark); at != std::string::npos; at = text.find(mark))
        text.replace(at, mark.size(), std::to_string(tag));
    return text;
}

/// A structure from `model`, rendered into `scene` by a renderer without services.
struct Rendered {
    Rendered(TarvexModel const& model, RenderScene& scene)
        : structure(buildStructure(model)), renderer(structure.get(), &scene.builder, nullptr) {}
    std::unique_ptr<VizProductStructure> structure;
    TarvexRendererProbe renderer;
};

std::uint32_t productTag(TarvexRenderer const& renderer) {
    return renderer.GetProductRenderId()[1];
}

} // namespace

TEST(TarvexRendererScene, DrawsEachReferenceOnceAndReferencesItFromFurtherInstances) {
    RenderScene scene;
    auto structure = plate(false);
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    progress().clear();
    renderer.SetProgressCallback(recordProgress);
    ASSERT_TRUE(renderer.Render());

    std::uint32_t const T = productTag(renderer);
    RenderId const p1 = pathOf({1, T, 1000});
    std::uint32_t const wireId =
        scene.builder.FindNode(pathOf({1, T, 1000, 10007, 10006, 13}))->GetChild(0)->GetTag();
    std::string const part = "      10007 level \"Part\"\n"
                             "        10006 type \"Geometry\"\n"
                             "          {B} body \"Mesh{B}\"\n"
                             "            10002 type \"MeshFaces\"\n"
                             "              1 entity \"MeshGeometry\" {polygon#{F} mode=1 n=3 "
                             "c=192,192,192,255}\n"
                             "            10001 type \"MeshEdges\"\n"
                             "              2 entity \"MeshGeometry\" {polyline#{E} pts=2 "
                             "c=0,0,0,255}\n";
    auto partOf = [&](char const* body, char const* face, char const* edge) {
        std::string text = part;
        for (auto [mark, value] : {std::pair{"{B}", body}, {"{F}", face}, {"{E}", edge}})
            for (std::size_t at = text.find(mark); at != std::string::npos; at = text.find(mark))
                text.replace(at, 3, value);
        return text;
    };
    EXPECT_EQ(scene.builder.Dump(),
              withProductTag("1 scene \"ROOT\"\n"
                             "  {T} container(1) \"Plate\"\n"
                             "    1000 level \"P.1\" T=[1 0 0 10; 0 1 0 0; 0 0 1 0]\n",
                             T) +
                  partOf("12", "0", "1") + "          13 body \"Wire13\"\n" + "            " +
                  std::to_string(wireId) + " entity \"WireEdge\" {polyline#2 pts=2 c=0,0,0,255}\n" +
                  withProductTag("    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
                                 "      -> ref 1/{T}/1000/10007\n"
                                 "    1002 level \"Q.1\" T=[1 0 0 30; 0 1 0 0; 0 0 1 0]\n",
                                 T) +
                  partOf("14", "3", "4"));

    // The link map: the product, every instance, and a part record for each part instance.
    std::vector<std::pair<EntityId, RenderId>> const expected = {
        {EntityId(Node::RootNodeId, KolbaVizCore::Link, T), pathOf({1, T})},
        {EntityId(T, KolbaVizCore::Link, 1000), p1},
        {EntityId(1000, 40000, 1000), p1},
        {EntityId(T, KolbaVizCore::Link, 1001), pathOf({1, T, 1001})},
        {EntityId(1001, 40000, 1001), pathOf({1, T, 1001})},
        {EntityId(T, KolbaVizCore::Link, 1002), pathOf({1, T, 1002})},
        {EntityId(1002, 40000, 1002), pathOf({1, T, 1002})}};
    EXPECT_EQ(renderer.linkMap().size(), expected.size());
    for (auto const& [key, path] : expected) {
        auto const found = renderer.linkMap().find(key);
        ASSERT_NE(found, renderer.linkMap().end());
        EXPECT_TRUE(SameRenderId(found->second, path));
    }

    // Elements and entries carry what was drawn for them.
    RenderId meshPath;
    EntityId meshEntity;
    KolbaVizCore::VizMesh const& mesh = *structure->GetVizContainer(10)->GetMeshes()[0];
    ASSERT_TRUE(mesh.Get3DRenderID(meshPath));
    EXPECT_TRUE(SameRenderId(meshPath, pathOf({1, T, 1000, 10007, 10006, 12})));
    ASSERT_TRUE(mesh.GetEntityID(meshEntity));
    EXPECT_EQ(meshEntity, EntityId(10006, KolbaVizCore::Body, 12));
    EntityId entryEntity;
    ASSERT_TRUE(structure->GetChildren()[1]->GetEntityID(entryEntity));
    EXPECT_EQ(entryEntity, EntityId(T, KolbaVizCore::Link, 1001));

    // A further instance adds no record, so the part count does not grow with it.
    std::vector<int> done;
    for (Progress const& call : progress())
        if (call.phase == "RenderPart")
            done.push_back(call.done);
    EXPECT_EQ(done, (std::vector<int>{1, 2, 2}));
    ASSERT_FALSE(progress().empty());
    EXPECT_EQ(progress().front().phase, "RenderInit");
    EXPECT_EQ(progress().back().phase, "RenderEnd");
    EXPECT_EQ(progress().back().done, 2);
}

TEST(TarvexRendererScene, InsideAnAssemblyTheInstanceTagsMoveOneLevelDown) {
    RenderScene scene;
    auto structure = plate(true);
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    ASSERT_TRUE(renderer.Render());
    std::uint32_t const T = productTag(renderer);

    Node const* assembly = scene.builder.FindNode(pathOf({1, T, 1000}));
    ASSERT_NE(assembly, nullptr);
    EXPECT_EQ(assembly->GetName(), u"A.1");
    std::vector<std::uint32_t> tags;
    for (std::size_t i = 0; i < assembly->GetChildCount(); ++i)
        tags.push_back(assembly->GetChild(i)->GetTag());
    EXPECT_EQ(tags, (std::vector<std::uint32_t>{2000, 2001, 2002}));
    Node const* second = assembly->GetChild(1);
    ASSERT_EQ(second->GetReferenceCount(), 1u);
    EXPECT_EQ(second->GetReference(0), assembly->GetChild(0)->FindChild(10007));
    EXPECT_FALSE(renderer.hasMultipleRoots());
    EXPECT_NE(renderer.linkMap().find(EntityId(1000, KolbaVizCore::Link, 2001)),
              renderer.linkMap().end());
    EXPECT_EQ(renderer.linkMap().find(EntityId(1000, 40000, 1000)), renderer.linkMap().end())
        << "an assembly gets no part record";

    // World placements go through the reference: P.2's mesh stands at x = 20.
    KolbaVizCore::Matrix4 world;
    ASSERT_TRUE(
        scene.builder.GetWorldTransform(pathOf({1, T, 1000, 2001, 10007, 10006, 12}), world));
    EXPECT_DOUBLE_EQ(world.At(0, 3), 20.0);
}

TEST(TarvexRendererScene, MissingNamesAreMadeFromIdsOrIndices) {
    TarvexModel model;
    model.SetProductName(u"");
    model.AddAssembly(30, u"A");
    model.AddPart(7, u"");
    model.AddRootInstance(30, u"");
    model.AddRootInstance(7, u"");
    for (int i = 0; i < 4; ++i)
        model.AddInstance(30, 7, i == 3 ? std::optional<WString>(u"") : u"named");
    RenderScene scene;
    Rendered r(model, scene);
    ASSERT_TRUE(r.renderer.Render());
    std::uint32_t const T = productTag(r.renderer);

    EXPECT_EQ(scene.builder.FindNode(pathOf({1, T}))->GetName(), VizPort::Widen(std::to_string(T)));
    EXPECT_EQ(scene.builder.FindNode(pathOf({1, T, 1000}))->GetName(), u"InstanceOfReference_A");
    EXPECT_EQ(scene.builder.FindNode(pathOf({1, T, 1001}))->GetName(), u"InstanceOfReference_7")
        << "a root entry is named by its reference id";
    EXPECT_EQ(scene.builder.FindNode(pathOf({1, T, 1000, 2003}))->GetName(),
              u"InstanceOfReference_3")
        << "a nested entry by its index";
}

TEST(TarvexRendererScene, TagsOfAThousandChildrenRunIntoTheNextLevel) {
    TarvexModel model;
    model.AddAssembly(1, u"Rack");
    model.AddPart(2, u"Bolt");
    model.AddRootInstance(1, u"Rack.1");
    for (int i = 0; i < 1001; ++i)
        model.AddInstance(1, 2, u"Bolt");
    RenderScene scene;
    Rendered r(model, scene);
    ASSERT_TRUE(r.renderer.Render());
    Node const* rack = scene.builder.FindNode(pathOf({1, productTag(r.renderer), 1000}));
    ASSERT_EQ(rack->GetChildCount(), 1001u);
    EXPECT_EQ(rack->GetChild(999)->GetTag(), 2999u);
    EXPECT_EQ(rack->GetChild(1000)->GetTag(), 3000u);
}

TEST(TarvexRendererScene, TheOutermostColouredInstanceColoursEveryPartBelowIt) {
    TarvexModel model;
    model.AddAssembly(1, u"Outer");
    model.AddAssembly(2, u"Inner");
    model.AddPart(3, u"Part");
    TarvexAuthoredInstance& outer = model.AddRootInstance(1, u"Outer.1");
    outer.rgb = std::array<unsigned short, 3>{255, 0, 0};
    TarvexAuthoredInstance& inner = model.AddInstance(1, 2, u"Inner.1");
    inner.rgb = std::array<unsigned short, 3>{0, 255, 0};
    model.AddInstance(2, 3, u"Deep");
    model.AddInstance(1, 3, u"Shallow");
    TarvexAuthoredInstance& translucent = model.AddRootInstance(3, u"Translucent");
    translucent.alpha = 128;
    model.AddRootInstance(3, u"Plain");
    RenderScene scene;
    KolbaVizCore::RenderingOptions options;
    options.SetDefaultFaceColor(KolbaVizCore::RGBAColor(9, 9, 9, 255));
    scene.builder.SetRenderingOptions(options);
    Rendered r(model, scene);
    ASSERT_TRUE(r.renderer.Render());
    std::uint32_t const T = productTag(r.renderer);

    struct Expect {
        RenderId path;
        bool coloured;
        KolbaVizCore::RGBAColor color;
    };
    KolbaVizCore::RGBAColor const red(255, 0, 0, 255);
    for (Expect const& e :
         {Expect{pathOf({1, T, 1000}), false, {}}, Expect{pathOf({1, T, 1000, 2000}), false, {}},
          Expect{pathOf({1, T, 1000, 2000, 3000}), true, red},
          Expect{pathOf({1, T, 1000, 2001}), true, red},
          Expect{pathOf({1, T, 1001}), true, KolbaVizCore::RGBAColor(9, 9, 9, 128)},
          Expect{pathOf({1, T, 1002}), false, {}}}) {
        Node const* node = scene.builder.FindNode(e.path);
        ASSERT_NE(node, nullptr);
        SCOPED_TRACE(VizPort::Narrow(node->GetName()));
        EXPECT_EQ(node->HasOwnColor(), e.coloured);
        if (e.coloured) {
            EXPECT_EQ(node->GetColor(), e.color);
        }
    }
}

TEST(TarvexRendererScene, HiddenAndSuppressedInstancesStandInvisibleOutsideTheExtents) {
    TarvexModel model;
    model.AddPart(1, u"Cube");
    model.AddAssembly(2, u"Holder");
    model.AddRootInstance(1, u"Shown").placement = at(0);
    TarvexAuthoredInstance& hidden = model.AddRootInstance(1, u"Hidden");
    hidden.placement = at(100);
    hidden.hidden = true;
    TarvexAuthoredInstance& suppressed = model.AddRootInstance(1, u"Suppressed");
    suppressed.placement = at(-100);
    suppressed.suppressed = true;
    TarvexAuthoredInstance& holder = model.AddRootInstance(2, u"HiddenHolder");
    holder.hidden = true;
    model.AddInstance(2, 1, u"VisibleChild").placement = at(0, 50);
    RenderScene scene;
    Rendered r(model, scene);
    Peer::addVizContainer(*r.structure, 1, makeMeshContainer(1, 5, 0));
    ASSERT_TRUE(r.renderer.Render());
    std::uint32_t const T = productTag(r.renderer);

    EXPECT_TRUE(scene.builder.FindNode(pathOf({1, T, 1000}))->IsVisible());
    EXPECT_FALSE(scene.builder.FindNode(pathOf({1, T, 1001}))->IsVisible());
    EXPECT_FALSE(scene.builder.FindNode(pathOf({1, T, 1002}))->IsVisible());
    EXPECT_FALSE(scene.builder.FindNode(pathOf({1, T, 1003}))->IsVisible());
    EXPECT_TRUE(scene.builder.FindNode(pathOf({1, T, 1003, 2000}))->IsVisible())
        << "a child keeps its own flag";
    // The triangle spans [0,1] x [0,1]; the visible child's box is placed by its own
    // placement alone, at y = 50.
    float box[6];
    r.renderer.GetGeometryBox(box);
    EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{0, 0, 0, 1, 51, 0}));
}

TEST(TarvexRendererScene, APartContainerWinsOverAVizContainer) {
    TarvexModel model;
    model.AddPart(4, u"Both");
    model.AddRootInstance(4, u"Both.1");
    model.AddRootInstance(4, u"Both.2").placement = at(5);
    RenderScene scene;
    auto structure = buildStructure(model);
    Peer::addVizContainer(*structure, 4, makeMeshContainer(4, 9, 0));
    Peer::addPartContainer(*structure, 4, new TestPartContainer(u"Both", 4));
    BrepTestModeler modeler;
    int created = 0;
    modeler.created = &created;
    {
        TarvexRendererProbe renderer(structure.get(), &scene.builder, &modeler);
        ASSERT_TRUE(renderer.Render());
        std::uint32_t const T = productTag(renderer);
        Node const* first = scene.builder.FindNode(pathOf({1, T, 1000}));
        ASSERT_EQ(first->GetChildCount(), 1u);
        EXPECT_EQ(first->GetChild(0)->GetName(), u"Brep");
        EXPECT_EQ(scene.builder.FindNode(pathOf({1, T, 1001}))->GetReference(0),
                  first->GetChild(0));
        EXPECT_EQ(created, 1);
        EXPECT_EQ(renderer.brepRenderMap().size(), 1u);
        EXPECT_TRUE(renderer.geometryRenderMap().empty());
        EXPECT_EQ(TestBrepRenderer::live(), 1);
        // Unit box moved by each placement: x from 0 to 6.
        float box[6];
        renderer.GetGeometryBox(box);
        EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{0, 0, 0, 6, 1, 1}));
    }
    EXPECT_EQ(TestBrepRenderer::live(), 0);
    EXPECT_EQ(scene.builder.GetNodeCount(), 1u) << "only ROOT stays";
}

TEST(TarvexRendererScene, ATinyScaleReachesTheBoxButNotTheBodies) {
    struct Case {
        double scale;
        bool bodyScaled;
        float high;
    };
    for (Case const c : {Case{1e-6, false, 1e-6f}, Case{2.0, true, 2.0f}, Case{-1.0, true, 0.0f},
                         Case{1.0, false, 1.0f}}) {
        SCOPED_TRACE(c.scale);
        TarvexModel model;
        model.AddPart(1, u"P");
        model.AddRootInstance(1, u"P.1");
        RenderScene scene;
        Rendered r(model, scene);
        VizContainer* container = makeMeshContainer(1, 3, 0);
        container->SetScaleFactor(c.scale);
        Peer::addVizContainer(*r.structure, 1, container);
        ASSERT_TRUE(r.renderer.Render());
        Node const* body =
            scene.builder.FindNode(pathOf({1, productTag(r.renderer), 1000, 10007, 10006, 3}));
        ASSERT_NE(body, nullptr);
        EXPECT_EQ(body->GetTransform().At(0, 0) != 1.0, c.bodyScaled);
        float box[6];
        r.renderer.GetGeometryBox(box);
        EXPECT_FLOAT_EQ(box[3], c.high);
    }
}

TEST(TarvexRendererScene, MeshesWiresAndPointSetsOfBothKindsShareOneGeometryNode) {
    TarvexModel model;
    model.AddPart(1, u"P");
    model.AddRootInstance(1, u"P.1");
    RenderScene scene;
    Rendered r(model, scene);
    auto container = std::make_unique<VizContainer>(1);
    auto make = [](auto element, int id) {
        element->setID(static_cast<unsigned long>(id));
        return element.release();
    };
    container->AddCGPointSet(make(std::make_unique<KolbaVizCore::VizPointSet>(), 6));
    container->AddCGWire(make(std::make_unique<KolbaVizCore::VizWire>(), 4));
    container->AddCGMesh(makeMesh(2, 0));
    container->AddPointSet(make(std::make_unique<KolbaVizCore::VizPointSet>(), 5));
    container->AddWire(make(std::make_unique<KolbaVizCore::VizWire>(), 3));
    container->AddMesh(makeMesh(1, 0));
    container->AddMesh(nullptr);
    Peer::addVizContainer(*r.structure, 1, container.release());
    ASSERT_TRUE(r.renderer.Render());
    Node const* geometry =
        scene.builder.FindNode(pathOf({1, productTag(r.renderer), 1000, 10007, 10006}));
    ASSERT_NE(geometry, nullptr);
    std::vector<WString> names;
    for (std::size_t i = 0; i < geometry->GetChildCount(); ++i)
        names.push_back(geometry->GetChild(i)->GetName());
    EXPECT_EQ(names, (std::vector<WString>{u"Mesh1", u"Mesh2", u"Wire3", u"Wire4", u"PointSet5",
                                           u"PointSet6"}));
}

TEST(TarvexRendererScene, ARefusedLevelSkipsWhatStandsBelowItAndTheWalkGoesOn) {
    struct Case {
        char const* name;
        std::function<void(KolbaVizCore::SceneBuilder&)> refuse;
        std::vector<std::vector<std::uint32_t>> present; ///< tags below the product
        std::vector<std::vector<std::uint32_t>> absent;
        bool productNode;
    };
    std::vector<Case> const cases = {
        {"an instance: its index is still used",
         [](auto& b) { b.FailContextsNamed(u"P.1"); },
         {{1001}, {1002, 10007}},
         {{1000}},
         true},
        {"every Part node: the instances stand, empty",
         [](auto& b) { b.FailContextsTagged(10007); },
         {{1000}, {1001}},
         {{1000, 10007}, {1001, 10007}},
         true},
        {"the product",
         [](auto& b) { b.FailContextsOfKind(KolbaVizCore::ContextKind::Container); },
         {},
         {},
         false},
        {"the construction",
         [](auto& b) { b.FailContextsOfKind(KolbaVizCore::ContextKind::Construction); },
         {},
         {},
         false},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        RenderScene scene;
        auto structure = plate(false);
        c.refuse(scene.builder);
        TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
        EXPECT_TRUE(renderer.Render()) << "a refused level is no failure";
        EXPECT_EQ(scene.builder.GetOpenLevelCount(), 0);
        ASSERT_EQ(!renderer.GetProductRenderId().IsEmpty(), c.productNode);
        if (!c.productNode)
            continue;
        std::uint32_t const T = productTag(renderer);
        auto const below = [&](std::vector<std::uint32_t> const& tags) {
            RenderId path = pathOf({1, T});
            for (std::uint32_t const tag : tags)
                path.AddValue(tag);
            return scene.builder.FindNode(path);
        };
        for (auto const& tags : c.present)
            EXPECT_NE(below(tags), nullptr) << tags.back();
        for (auto const& tags : c.absent)
            EXPECT_EQ(below(tags), nullptr) << tags.back();
    }
}

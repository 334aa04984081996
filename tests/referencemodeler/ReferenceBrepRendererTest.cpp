#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include "support/TestPartContainer.h"
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <vector>

namespace VizReferenceModeler {
namespace {

using KolbaVizCore::ARenderer;
using KolbaVizCore::ContextKind;
using KolbaVizCore::Node;
using KolbaVizCore::SceneBuilder;

constexpr unsigned int PinId = 3;
constexpr unsigned int BoltId = 4;
constexpr std::uint32_t ProductTag = 77;
constexpr std::uint32_t FirstInstance = 1000;
constexpr std::uint32_t SecondInstance = 1001;
constexpr std::uint32_t ThirdInstance = 1002;

/// Pin (3): face 101 of two triangles, face 102 of one, edges 201 (2 points) and 202
/// (3 points), spanning (0, 0, 0) to (2, 1, 3). Bolt (4): one face that is also numbered
/// 101, and no edge.
TarvexModel MakeModel() {
    TarvexModel model;
    model.SetProductName(u"Frame");
    TarvexAuthoredPartGeometry& pin = model.AddPart(PinId, u"Pin").geometry;
    pin.faces.push_back({101, {0, 0, 0, 2, 0, 0, 2, 1, 0, 0, 1, 0}, {0, 1, 2, 0, 2, 3}});
    pin.faces.push_back({102, {0, 0, 3, 2, 0, 3, 0, 1, 3}, {0, 1, 2}});
    pin.edges.push_back({201, {0, 0, 0, 0, 0, 3}});
    pin.edges.push_back({202, {0, 0, 0, 2, 0, 0, 2, 1, 0}});
    model.AddPart(BoltId, u"Bolt")
        .geometry.faces.push_back({101, {5, 5, 5, 6, 5, 5, 5, 6, 5}, {0, 1, 2}});
    model.AddRootInstance(PinId, u"Pin.1");
    model.AddRootInstance(BoltId, u"Bolt.1");
    return model;
}

/// A container imported by the modeler, owned here.
std::unique_ptr<VizPartContainer> Import(ReferenceModelerServices& services,
                                         TarvexModel const& model, unsigned int referenceId) {
    TarvexPartDocument document = model.GetInputProductStructure()
                                      .GetReferenceFromId(static_cast<int>(referenceId))
                                      .GetDocument();
    TarvexPartImportResult result;
    VizPartContainer* raw = nullptr;
    WString error;
    bool const ok =
        services.ImportPart(static_cast<int>(referenceId), document, result, raw, nullptr, error);
    std::unique_ptr<VizPartContainer> container(raw);
    EXPECT_TRUE(ok && container) << VizPort::Narrow(error);
    return container;
}

RenderId PathOf(std::vector<std::uint32_t> const& tags) {
    RenderId path(1);
    for (std::uint32_t const tag : tags)
        path.AddValue(tag);
    return path;
}

RenderId Below(RenderId path, std::vector<std::uint32_t> const& tags) {
    for (std::uint32_t const tag : tags)
        path.AddValue(tag);
    return path;
}

RenderId InstancePath(std::uint32_t instance) {
    return PathOf({Node::RootNodeId, ProductTag, instance});
}

/// The body of `part` below the part node of the drawing at `instance`.
RenderId BodyPath(std::uint32_t instance, std::uint32_t part) {
    return Below(
        InstancePath(instance),
        {ReferenceBrepRenderer::PartTag, ReferenceBrepRenderer::BrepTag, KolbaVizCore::Body, part});
}

RenderId EntityPath(std::uint32_t instance, std::uint32_t part, std::uint32_t type,
                    std::uint32_t id) {
    return Below(BodyPath(instance, part), {type, id});
}

/// The scene top, the product and one instance node open, as the product renderer has them
/// when it draws a part.
class InstanceLevels {
public:
    InstanceLevels(SceneBuilder& builder, std::uint32_t instance)
        : m_construction(&builder), m_scene(&builder, Node::RootNodeId, u"ROOT"),
          m_product(&builder, ProductTag, u"Product"), m_instance(&builder, instance, u"Instance") {
    }

private:
    KolbaVizCore::ConstructionContext const m_construction;
    KolbaVizCore::SceneContext const m_scene;
    KolbaVizCore::SceneLevelContext const m_product;
    KolbaVizCore::SceneLevelContext const m_instance;
};

bool SameTags(RenderId const& left, RenderId const& right) {
    return left.GetTags() == right.GetTags();
}

class ReferenceBrepRendererTest : public ::testing::Test {
protected:
    ReferenceBrepRendererTest() {
        builder.SetGeometryItemFactory(
            std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    }

    struct Drawn {
        std::unique_ptr<ARenderer> renderer;
        bool rendered = false;
    };

    /// Draws `container` below instance node `instance` the way the product renderer does.
    Drawn Draw(VizPartContainer* container, std::uint32_t instance) {
        InstanceLevels const levels(builder, instance);
        RenderId current;
        EXPECT_TRUE(builder.GetCurrentRenderId(current));
        Drawn drawn;
        drawn.renderer.reset(services.CreateRenderer(container, &builder, &current));
        if (!drawn.renderer)
            return drawn;
        drawn.renderer->SetBuilderOwnership(false);
        drawn.rendered = drawn.renderer->Render();
        return drawn;
    }

    /// Shows what `path` names below instance node `instance` too, as a further instance.
    bool Reference(std::uint32_t instance, RenderId const& path) {
        InstanceLevels const levels(builder, instance);
        return builder.AddNodeReference(path);
    }

    TarvexModel const model = MakeModel();
    ReferenceModelerServices services;
    std::unique_ptr<VizPartContainer> const pin = Import(services, model, PinId);
    std::unique_ptr<VizPartContainer> const bolt = Import(services, model, BoltId);
    SceneBuilder builder;
};

TEST_F(ReferenceBrepRendererTest, DrawsTheBodyWithItsFacesAndEdgesOneLevelBelowTheCurrentNode) {
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(drawn.renderer);
    ASSERT_TRUE(drawn.rendered);
    EXPECT_EQ(builder.GetOpenLevelCount(), 0);

    RenderId const part = drawn.renderer->GetRenderId();
    EXPECT_TRUE(SameTags(part, Below(InstancePath(FirstInstance), {10011})));
    EXPECT_EQ(part.GetLeading(), 1u);

    EXPECT_EQ(builder.Dump(), "1 scene \"ROOT\"\n"
                              "  77 level \"Product\"\n"
                              "    1000 level \"Instance\"\n"
                              "      10011 level \"BrepPart\"\n"
                              "        1 level \"Brep\"\n"
                              "          10003 type \"Bodies\"\n"
                              "            3 body \"Body3\"\n"
                              "              10002 type \"Faces\"\n"
                              "                101 entity \"Face101\" {polygon#101 mode=1 n=6}\n"
                              "                102 entity \"Face102\" {polygon#102 mode=1 n=3}\n"
                              "              10001 type \"Edges\"\n"
                              "                201 entity \"Edge201\" {polyline#201 pts=2}\n"
                              "                202 entity \"Edge202\" {polyline#202 pts=3}\n");

    // Where the product renderer reads ids: with base the length of the part node's path,
    // the body tag at index base + 2 and the face or edge id at base + 4.
    int const base = part.Length();
    RenderId const face = EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 102);
    ASSERT_EQ(face.Length(), base + 5);
    EXPECT_EQ(face[base + 2], PinId);
    EXPECT_EQ(face[base + 4], 102u);

    Node const* const faceNode = builder.FindNode(face);
    ASSERT_NE(faceNode, nullptr);
    EXPECT_EQ(faceNode->GetKind(), ContextKind::Entity);
    EXPECT_FALSE(faceNode->HasOwnColor()) << "an instance's colour must reach the faces";
    auto const* const polygon =
        dynamic_cast<KolbaVizCore::PolygonItem const*>(faceNode->GetItem(0));
    ASSERT_NE(polygon, nullptr);
    EXPECT_EQ(polygon->GetVertices(), (std::vector<float>{0, 0, 3, 2, 0, 3, 0, 1, 3}));
    EXPECT_EQ(polygon->GetNormals(), (std::vector<float>{0, 0, 1, 0, 0, 1, 0, 0, 1}))
        << "the triangle's normal at each corner";
}

TEST_F(ReferenceBrepRendererTest, LeavesOutTheLevelsOfKindsThePartHasNone) {
    ReferencePartContainer empty(u"Empty", 9, nullptr);
    Drawn const bolts = Draw(bolt.get(), FirstInstance);
    Drawn const nothing = Draw(&empty, SecondInstance);
    ASSERT_TRUE(bolts.rendered);
    ASSERT_TRUE(nothing.rendered) << "a part without faces is drawn as its body";

    Node const* const boltBody = builder.FindNode(BodyPath(FirstInstance, BoltId));
    ASSERT_NE(boltBody, nullptr);
    ASSERT_EQ(boltBody->GetChildCount(), 1u);
    EXPECT_EQ(boltBody->GetChild(0)->GetTag(), static_cast<std::uint32_t>(KolbaVizCore::Face));

    Node const* const emptyBody = builder.FindNode(BodyPath(SecondInstance, 9));
    ASSERT_NE(emptyBody, nullptr);
    EXPECT_EQ(emptyBody->GetName(), u"Body9");
    EXPECT_EQ(emptyBody->GetChildCount(), 0u);

    float box[6];
    nothing.renderer->GetGeometryBox(box);
    EXPECT_GT(box[0], box[3]) << "no points: an empty box";
    EXPECT_EQ(nothing.renderer->GetGeometryRadius(), 0.0f);
}

TEST_F(ReferenceBrepRendererTest, DrawsNodesWithoutItemsWhenTheBuilderHasNoFactory) {
    builder.SetGeometryItemFactory(nullptr);
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(drawn.rendered);
    for (RenderId const& path : {EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 101),
                                 EntityPath(FirstInstance, PinId, KolbaVizCore::Edge, 202)}) {
        Node const* const node = builder.FindNode(path);
        ASSERT_NE(node, nullptr);
        EXPECT_EQ(node->GetItemCount(), 0u);
    }
}

TEST_F(ReferenceBrepRendererTest, GivesThePartsBoxInItsOwnCoordinatesOnceDrawn) {
    InstanceLevels const levels(builder, FirstInstance);
    RenderId current;
    builder.GetCurrentRenderId(current);
    std::unique_ptr<ARenderer> const renderer(
        services.CreateRenderer(pin.get(), &builder, &current));
    ASSERT_TRUE(renderer);

    float box[6];
    renderer->GetGeometryBox(box);
    EXPECT_GT(box[0], box[3]) << "nothing drawn yet";

    ASSERT_TRUE(renderer->Render());
    renderer->GetGeometryBox(box);
    EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{0, 0, 0, 2, 1, 3}));
    float center[3];
    renderer->GetGeometryCenter(center);
    EXPECT_EQ(std::vector<float>(center, center + 3), (std::vector<float>{1, 0.5f, 1.5f}));
    EXPECT_FLOAT_EQ(renderer->GetGeometryRadius(), static_cast<float>(std::sqrt(14.0) / 2.0));
}

TEST_F(ReferenceBrepRendererTest, ConvertsBothWaysAlsoThroughAFurtherInstance) {
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(drawn.rendered);
    ASSERT_TRUE(Reference(SecondInstance, drawn.renderer->GetRenderId()));
    ARenderer& renderer = *drawn.renderer;

    struct Case {
        char const* what;
        RenderId path; ///< below the first instance
        EntityId entity;
    };
    Case const cases[] = {
        {"face of two triangles", EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 101),
         EntityId(PinId, KolbaVizCore::Face, 101)},
        {"face", EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 102),
         EntityId(PinId, KolbaVizCore::Face, 102)},
        {"edge", EntityPath(FirstInstance, PinId, KolbaVizCore::Edge, 202),
         EntityId(PinId, KolbaVizCore::Edge, 202)},
        {"body", BodyPath(FirstInstance, PinId), EntityId(PinId, KolbaVizCore::Body, PinId)},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.what);
        EntityId entity;
        ASSERT_TRUE(renderer.Convert(c.path, entity));
        EXPECT_TRUE(entity == c.entity);

        RenderId further = c.path;
        further[2] = SecondInstance;
        entity = EntityId();
        ASSERT_TRUE(renderer.Convert(further, entity)) << "through the referencing node";
        EXPECT_TRUE(entity == c.entity);

        RenderId back;
        ASSERT_TRUE(renderer.Convert(c.entity, back));
        EXPECT_TRUE(SameTags(back, c.path));
        EXPECT_EQ(back.GetLeading(), 1u);
        EXPECT_NE(builder.FindNode(back), nullptr);
    }

    // The level of the edges reads as the body, as the index rule has it.
    EntityId entity;
    ASSERT_TRUE(
        renderer.Convert(Below(BodyPath(FirstInstance, PinId), {KolbaVizCore::Edge}), entity));
    EXPECT_TRUE(entity == EntityId(PinId, KolbaVizCore::Body, PinId));
}

TEST_F(ReferenceBrepRendererTest, ConvertsNothingOutsideItsDrawing) {
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    Drawn const other = Draw(bolt.get(), ThirdInstance);
    ASSERT_TRUE(drawn.rendered && other.rendered);
    ARenderer& renderer = *drawn.renderer;
    RenderId const part = renderer.GetRenderId();

    struct PathCase {
        char const* what;
        RenderId path;
    };
    PathCase const paths[] = {
        {"the part node", part},
        {"the bodies level", Below(part, {1, KolbaVizCore::Body})},
        {"an instance that does not reference the part",
         EntityPath(SecondInstance, PinId, KolbaVizCore::Face, 101)},
        {"another part's drawing of a face of the same id",
         EntityPath(ThirdInstance, BoltId, KolbaVizCore::Face, 101)},
        {"a face the part lacks", EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 999)},
        {"an edge id below the faces", EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 201)},
        {"below a face", Below(EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 101), {1})},
        {"empty", RenderId()},
    };
    EntityId const untouched(1, 2, 3);
    for (PathCase const& c : paths) {
        SCOPED_TRACE(c.what);
        EntityId entity = untouched;
        EXPECT_FALSE(renderer.Convert(c.path, entity));
        EXPECT_TRUE(entity == untouched);
    }

    struct EntityCase {
        char const* what;
        EntityId entity;
    };
    EntityCase const entities[] = {
        {"another part's face", EntityId(BoltId, KolbaVizCore::Face, 101)},
        {"an edge id as a face", EntityId(PinId, KolbaVizCore::Face, 201)},
        {"a face id as an edge", EntityId(PinId, KolbaVizCore::Edge, 101)},
        {"a kind the part does not draw", EntityId(PinId, KolbaVizCore::Vertex, 101)},
        {"another body", EntityId(BoltId, KolbaVizCore::Body, BoltId)},
        {"a body that is not the reference", EntityId(PinId, KolbaVizCore::Body, 101)},
        {"a default id", EntityId()},
    };
    for (EntityCase const& c : entities) {
        SCOPED_TRACE(c.what);
        RenderId path = PathOf({42});
        EXPECT_FALSE(renderer.Convert(c.entity, path));
        EXPECT_TRUE(SameTags(path, PathOf({42})));
    }
}

TEST_F(ReferenceBrepRendererTest, HighlightsAPathIntoItsDrawingAsItself) {
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(drawn.rendered);
    ASSERT_TRUE(Reference(SecondInstance, drawn.renderer->GetRenderId()));

    for (RenderId const& path : {EntityPath(FirstInstance, PinId, KolbaVizCore::Edge, 201),
                                 EntityPath(SecondInstance, PinId, KolbaVizCore::Edge, 201),
                                 drawn.renderer->GetRenderId()}) {
        RenderId* raw = nullptr;
        int count = 0;
        ASSERT_TRUE(drawn.renderer->ConvertToHighlight(path, raw, count));
        std::unique_ptr<RenderId[]> const ids(raw); // the caller's, released as an array
        ASSERT_EQ(count, 1);
        EXPECT_TRUE(SameTags(ids[0], path));
    }

    RenderId* raw = nullptr;
    int count = 0;
    EXPECT_FALSE(drawn.renderer->ConvertToHighlight(InstancePath(FirstInstance), raw, count));
    EXPECT_FALSE(drawn.renderer->ConvertToHighlight(
        EntityPath(FirstInstance, PinId, KolbaVizCore::Edge, 999), raw, count));
    EXPECT_EQ(raw, nullptr);
    EXPECT_EQ(count, 0);
}

/// What the product renderer does with a picked path: for each part container in key
/// order, read the ids at the indices of the part's renderer and ask the modeler, until one
/// answers.
bool ConvertLikeTheProduct(ReferenceModelerServices& services,
                           std::vector<std::pair<VizPartContainer*, ARenderer const*>> const& parts,
                           RenderId const& path, EntityId& out) {
    for (auto const& [container, renderer] : parts) {
        int const a = renderer->GetRenderId().Length() + 3;
        int const b = a + 2;
        if (path.Length() < a)
            continue;
        out = EntityId();
        out.SetId(path[path.Length() >= b ? b - 1 : a - 1]);
        out.SetParentId(path[a - 1]);
        if (services.ConvertToEntity(out.GetId(), container, out))
            return true;
    }
    return false;
}

TEST_F(ReferenceBrepRendererTest, ModelerAndRendererNameTheSameEntityForAPickedPath) {
    Drawn const pins = Draw(pin.get(), FirstInstance);
    Drawn const bolts = Draw(bolt.get(), SecondInstance);
    ASSERT_TRUE(pins.rendered && bolts.rendered);
    ASSERT_TRUE(Reference(ThirdInstance, pins.renderer->GetRenderId()));
    // Pin (3) before Bolt (4), as the product structure holds them.
    std::vector<std::pair<VizPartContainer*, ARenderer const*>> const parts{
        {pin.get(), pins.renderer.get()}, {bolt.get(), bolts.renderer.get()}};

    struct Case {
        char const* what;
        RenderId path;
        ARenderer* renderer; ///< the one whose drawing the path runs through
        EntityId expected;
    };
    Case const cases[] = {
        {"pin's face", EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 101),
         pins.renderer.get(), EntityId(PinId, KolbaVizCore::Face, 101)},
        {"pin's edge", EntityPath(FirstInstance, PinId, KolbaVizCore::Edge, 201),
         pins.renderer.get(), EntityId(PinId, KolbaVizCore::Edge, 201)},
        {"pin's face through the further instance",
         EntityPath(ThirdInstance, PinId, KolbaVizCore::Face, 102), pins.renderer.get(),
         EntityId(PinId, KolbaVizCore::Face, 102)},
        {"bolt's face of the id pin has too",
         EntityPath(SecondInstance, BoltId, KolbaVizCore::Face, 101), bolts.renderer.get(),
         EntityId(BoltId, KolbaVizCore::Face, 101)},
        {"pin's body", BodyPath(FirstInstance, PinId), pins.renderer.get(),
         EntityId(PinId, KolbaVizCore::Body, PinId)},
        {"bolt's faces level", Below(BodyPath(SecondInstance, BoltId), {KolbaVizCore::Face}),
         bolts.renderer.get(), EntityId(BoltId, KolbaVizCore::Body, BoltId)},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.what);
        EntityId modeler;
        ASSERT_TRUE(ConvertLikeTheProduct(services, parts, c.path, modeler));
        EXPECT_TRUE(modeler == c.expected);
        EntityId drawn;
        ASSERT_TRUE(c.renderer->Convert(c.path, drawn));
        EXPECT_TRUE(drawn == c.expected);
    }

    EntityId out;
    EXPECT_FALSE(
        ConvertLikeTheProduct(services, parts, Below(pins.renderer->GetRenderId(), {1}), out))
        << "too short to name a body";
    EXPECT_FALSE(ConvertLikeTheProduct(
        services, parts, EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 999), out));
}

TEST_F(ReferenceBrepRendererTest, ARefusedLevelLeavesOutWhatItWouldHold) {
    struct Case {
        char const* refused;
        bool rendered;
        std::vector<EntityId> drawn;
        std::vector<EntityId> missing;
    };
    EntityId const face(PinId, KolbaVizCore::Face, 101);
    EntityId const edge(PinId, KolbaVizCore::Edge, 201);
    EntityId const otherEdge(PinId, KolbaVizCore::Edge, 202);
    EntityId const body(PinId, KolbaVizCore::Body, PinId);
    Case const cases[] = {
        {"BrepPart", false, {}, {body, face, edge}},
        {"Brep", true, {}, {body, face, edge}},
        {"Body3", true, {}, {body, face, edge}},
        {"Faces", true, {body, edge, otherEdge}, {face}},
        {"Edge201", true, {body, face, otherEdge}, {edge}},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.refused);
        ASSERT_TRUE(builder.Clear());
        int const refusedBefore = builder.GetRefusedContextCount();
        builder.FailContextsNamed(VizPort::Widen(c.refused));

        Drawn const drawn = Draw(pin.get(), FirstInstance);
        builder.ClearContextFaults();
        ASSERT_TRUE(drawn.renderer);
        EXPECT_EQ(drawn.rendered, c.rendered);
        EXPECT_EQ(builder.GetRefusedContextCount(), refusedBefore + 1);
        EXPECT_EQ(builder.GetOpenLevelCount(), 0);
        if (!c.rendered) {
            EXPECT_TRUE(drawn.renderer->GetRenderId().IsEmpty()) << "nothing to record";
            EXPECT_EQ(builder.GetNodeCount(), 3u) << "the scene top, product and instance";
        }
        for (EntityId const& entity : c.drawn) {
            RenderId path;
            EXPECT_TRUE(drawn.renderer->Convert(entity, path)) << entity.GetId();
        }
        for (EntityId const& entity : c.missing) {
            RenderId path;
            EXPECT_FALSE(drawn.renderer->Convert(entity, path)) << entity.GetId();
        }
    }
}

TEST_F(ReferenceBrepRendererTest, DrawsOnceUntilClearedAndClearingTakesTheDrawingAway) {
    Drawn const drawn = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(drawn.rendered);
    ARenderer& renderer = *drawn.renderer;
    RenderId const part = renderer.GetRenderId();
    ASSERT_TRUE(Reference(SecondInstance, part));
    std::string const once = builder.Dump();
    std::size_t const nodes = builder.GetNodeCount();

    {
        InstanceLevels const levels(builder, FirstInstance);
        EXPECT_TRUE(renderer.Render()) << "the drawing stands";
    }
    EXPECT_EQ(builder.Dump(), once) << "no face is drawn twice";

    renderer.ClearAll();
    EXPECT_TRUE(renderer.GetRenderId().IsEmpty());
    EXPECT_EQ(builder.FindNode(part), nullptr);
    EXPECT_EQ(builder.FindNode(Below(InstancePath(SecondInstance), {10011})), nullptr)
        << "the further instance's reference goes with it";
    EXPECT_EQ(builder.GetNodeCount(), 4u) << "the scene top, product and two instances";
    EntityId entity;
    EXPECT_FALSE(
        renderer.Convert(EntityPath(FirstInstance, PinId, KolbaVizCore::Face, 101), entity));
    float box[6];
    renderer.GetGeometryBox(box);
    EXPECT_GT(box[0], box[3]);
    renderer.ClearAll(); // nothing left to remove

    {
        InstanceLevels const levels(builder, FirstInstance);
        ASSERT_TRUE(renderer.Render()) << "cleared, it draws again";
    }
    EXPECT_EQ(builder.GetNodeCount(), nodes);
    EXPECT_TRUE(SameTags(renderer.GetRenderId(), part));
}

TEST_F(ReferenceBrepRendererTest, DestroyingTheRendererLeavesItsDrawing) {
    RenderId part;
    {
        Drawn const drawn = Draw(pin.get(), FirstInstance);
        ASSERT_TRUE(drawn.rendered);
        part = drawn.renderer->GetRenderId();
    }
    EXPECT_NE(builder.FindNode(part), nullptr);
}

TEST_F(ReferenceBrepRendererTest, RendersOnlyBelowTheNodeItWasMadeFor) {
    RenderId first = InstancePath(FirstInstance);
    std::unique_ptr<ARenderer> const renderer(services.CreateRenderer(pin.get(), &builder, &first));
    ASSERT_TRUE(renderer);
    EXPECT_FALSE(renderer->Render()) << "no current node";
    {
        InstanceLevels const levels(builder, SecondInstance);
        EXPECT_FALSE(renderer->Render()) << "another node is current";
    }
    EXPECT_TRUE(renderer->GetRenderId().IsEmpty());
    EXPECT_EQ(builder.GetNodeCount(), 3u);

    // A renderer made without a path draws wherever the builder stands.
    std::unique_ptr<ARenderer> const anywhere(
        services.CreateRenderer(pin.get(), &builder, nullptr));
    ASSERT_TRUE(anywhere);
    {
        InstanceLevels const levels(builder, SecondInstance);
        EXPECT_TRUE(anywhere->Render());
    }
    EXPECT_TRUE(SameTags(anywhere->GetRenderId(), Below(InstancePath(SecondInstance), {10011})));
}

TEST_F(ReferenceBrepRendererTest, DoesNotDrawOverAnotherDrawingOfAPart) {
    Drawn const first = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(first.rendered);
    std::string const once = builder.Dump();

    Drawn const second = Draw(pin.get(), FirstInstance);
    ASSERT_TRUE(second.renderer);
    EXPECT_FALSE(second.rendered);
    EXPECT_TRUE(second.renderer->GetRenderId().IsEmpty());
    EXPECT_EQ(builder.Dump(), once);
}

TEST_F(ReferenceBrepRendererTest, CreateRendererGivesNullWithoutSomethingToDraw) {
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", static_cast<int>(PinId));
    RenderId current = InstancePath(FirstInstance);
    EXPECT_EQ(services.CreateRenderer(nullptr, &builder, &current), nullptr);
    EXPECT_EQ(services.CreateRenderer(&foreign, &builder, &current), nullptr)
        << "another modeler's container";
    EXPECT_EQ(services.CreateRenderer(pin.get(), nullptr, &current), nullptr);

    std::unique_ptr<ARenderer> const renderer(
        services.CreateRenderer(pin.get(), &builder, &current));
    ASSERT_NE(dynamic_cast<ReferenceBrepRenderer*>(renderer.get()), nullptr);
    EXPECT_FALSE(renderer->GetBuilderOwnership());
}

} // namespace
} // namespace VizReferenceModeler

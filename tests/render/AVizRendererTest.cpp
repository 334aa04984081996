#include "support/RenderFixture.h"
#include "support/ScriptedModeler.h"
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/render/AVizRenderer.h>

#include <gtest/gtest.h>

#include <memory>
#include <optional>

using namespace VizBridgeTarvex;
using KolbaVizCore::Node;
using KolbaVizCore::RGBAColor;
using KolbaVizCore::SceneBuilder;

namespace {

/// Opens the operations of the base for the tests; renders nothing of its own.
class ElementRenderer : public AVizRenderer {
public:
    ElementRenderer(SceneBuilder* builder, VizModelerServices* services)
        : AVizRenderer(builder, services) {}

    bool Render() override { return true; }
    void ClearAll() override { clearBase(); }
    bool Convert(RenderId const&, EntityId&) override { return false; }
    bool Convert(EntityId const&, RenderId&) override { return false; }
    bool ConvertToHighlight(RenderId const&, RenderId*&, int&) override { return false; }

    using AVizRenderer::clearBase;
    using AVizRenderer::expandBBox;
    using AVizRenderer::getNextTag;
    using AVizRenderer::makeNameFromTag;
    using AVizRenderer::rendererServices;
    using AVizRenderer::renderVizMesh;
    using AVizRenderer::renderVizPointSet;
    using AVizRenderer::renderVizText;
    using AVizRenderer::renderVizWire;

    void setExtents(VizBox const& box, float radius) {
        m_geometryBox = box;
        m_geometryRadius = radius;
    }

protected:
    bool preRender() override { return true; }
    void postRender() override {}
};

/// A scene top with one level (tag 5) open: where the elements land.
class AVizRendererTest : public ::testing::Test {
protected:
    AVizRendererTest()
        : construction(&scene.builder), top(&scene.builder, Node::RootNodeId, u"ROOT"),
          level(&scene.builder, 5, u"Body"), renderer(&scene.builder, nullptr) {}

    KolbaVizCore::Node const& body() { return *scene.builder.FindNode(pathOf({1, 5})); }
    KolbaVizCore::Node const& at(std::initializer_list<std::uint32_t> tags) {
        KolbaVizCore::Node const* node = scene.builder.FindNode(pathOf(tags));
        EXPECT_NE(node, nullptr);
        return *node;
    }

    RenderScene scene;
    KolbaVizCore::ConstructionContext construction;
    KolbaVizCore::SceneContext top;
    KolbaVizCore::SceneLevelContext level;
    ElementRenderer renderer;
};

} // namespace

TEST_F(AVizRendererTest, MeshPutsEachFaceAndEdgeOnItsOwnEntityNode) {
    KolbaVizCore::VizMesh mesh;
    for (float x : {0.0f, 2.0f, 4.0f})
        mesh.AddFace(makeTriangleFace(x));
    mesh.AddFace(nullptr);
    mesh.AddEdge(makeEdge({0, 0, 0, 5, 0, 0}));
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);

    KolbaVizCore::Node const& faces = at({1, 5, KolbaVizCore::Face});
    EXPECT_EQ(faces.GetName(), u"MeshFaces");
    ASSERT_EQ(faces.GetChildCount(), 3u);
    for (std::size_t i = 0; i < 3; ++i) {
        KolbaVizCore::Node const& face = *faces.GetChild(i);
        EXPECT_EQ(face.GetTag(), 1u);
        EXPECT_EQ(face.GetName(), u"MeshGeometry");
        ASSERT_EQ(face.GetItemCount(), 1u);
        EXPECT_EQ(face.GetItem(0)->GetTag(), i) << "one tag per polygon, in drawing order";
    }
    KolbaVizCore::Node const& edges = at({1, 5, KolbaVizCore::Edge});
    ASSERT_EQ(edges.GetChildCount(), 1u);
    EXPECT_EQ(edges.GetChild(0)->GetTag(), 2u);
    EXPECT_EQ(edges.GetChild(0)->GetItem(0)->GetTag(), 3u);
    double const low[3] = {0, 0, 0}, high[3] = {5, 1, 0};
    EXPECT_EQ(box, VizBox(low, high));
}

TEST_F(AVizRendererTest, PolygonItemsGetAFlatCopyOfThePointsTheOffsetsName) {
    KolbaVizCore::VizMesh mesh;
    auto face = std::make_unique<KolbaVizCore::VizFace>();
    float const vertices[12] = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0};
    face->SetVertices(12, vertices);
    face->SetNormals(12, vertices);
    auto polygon = std::make_unique<KolbaVizCore::VizPolygon>();
    int const offsets[4] = {9, 0, 6, 3};
    polygon->SetIndices(4, offsets);
    polygon->SetPolygonType(KolbaVizCore::TriangleFan);
    face->AddPolygon(polygon.release());
    mesh.AddFace(face.release());
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);

    auto const& item = dynamic_cast<KolbaVizCore::PolygonItem const&>(
        *at({1, 5, KolbaVizCore::Face}).GetChild(0)->GetItem(0));
    EXPECT_EQ(item.GetMode(), 3);
    EXPECT_EQ(item.GetIndices(), (std::vector<int>{0, 1, 2, 3}));
    EXPECT_EQ(item.GetVertices(), (std::vector<float>{0, 1, 0, 0, 0, 0, 1, 1, 0, 1, 0, 0}));
    EXPECT_EQ(item.GetNormals(), item.GetVertices());
}

TEST_F(AVizRendererTest, AlphaAboveZeroReachesFacesOnly) {
    struct Case {
        int alpha;
        std::uint8_t faceAlpha;
    };
    for (Case const c : {Case{0, 200}, Case{-1, 200}, Case{128, 128}, Case{0x1FF, 0xFF}}) {
        SCOPED_TRACE(c.alpha);
        KolbaVizCore::SceneLevelContext const holder(
            &scene.builder, static_cast<std::uint32_t>(100 + c.alpha), u"Holder");
        KolbaVizCore::VizMesh mesh;
        KolbaVizCore::VizFace* face = makeTriangleFace(0);
        face->SetColor(RGBAColor(10, 20, 30, 200));
        mesh.AddFace(face);
        KolbaVizCore::VizEdge* edge = makeEdge({0, 0, 0, 1, 0, 0});
        edge->SetColor(RGBAColor(1, 2, 3, 200));
        mesh.AddEdge(edge);
        VizBox box;
        renderer.renderVizMesh(mesh, box, c.alpha);
        RenderId holderPath;
        scene.builder.GetCurrentRenderId(holderPath);
        KolbaVizCore::Node const& node = *scene.builder.FindNode(holderPath);
        EXPECT_EQ(node.FindChild(KolbaVizCore::Face)->GetChild(0)->GetItem(0)->GetColor(),
                  RGBAColor(10, 20, 30, c.faceAlpha));
        EXPECT_EQ(node.FindChild(KolbaVizCore::Edge)->GetChild(0)->GetItem(0)->GetColor(),
                  RGBAColor(1, 2, 3, 200));
    }
}

TEST_F(AVizRendererTest, OnlyAnElementsOwnColourColoursItsNode) {
    KolbaVizCore::RenderingOptions options;
    options.SetDefaultFaceColor(RGBAColor(9, 9, 9, 255));
    scene.builder.SetRenderingOptions(options);
    KolbaVizCore::VizMesh mesh;
    KolbaVizCore::VizFace* coloured = makeTriangleFace(0);
    coloured->SetColor(RGBAColor(255, 0, 0, 255));
    mesh.AddFace(coloured);
    mesh.AddFace(makeTriangleFace(1));
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);

    KolbaVizCore::Node const& faces = at({1, 5, KolbaVizCore::Face});
    EXPECT_TRUE(faces.GetChild(0)->HasOwnColor());
    EXPECT_EQ(faces.GetChild(0)->GetColor(), RGBAColor(255, 0, 0, 255));
    EXPECT_FALSE(faces.GetChild(1)->HasOwnColor());
    EXPECT_EQ(faces.GetChild(0)->GetItem(0)->GetColor(), RGBAColor(255, 0, 0, 255));
    EXPECT_EQ(faces.GetChild(1)->GetItem(0)->GetColor(), RGBAColor(9, 9, 9, 255));
}

TEST_F(AVizRendererTest, DegenerateElementsBuildNothingAndTakeNoTag) {
    KolbaVizCore::VizMesh mesh;
    mesh.AddFace(makeTriangleFace(0, KolbaVizCore::UndefinedTriangles));
    auto twoIndices = std::make_unique<KolbaVizCore::VizFace>();
    auto polygon = std::make_unique<KolbaVizCore::VizPolygon>();
    int const offsets[2] = {0, 3};
    polygon->SetIndices(2, offsets);
    polygon->SetPolygonType(KolbaVizCore::Triangles);
    twoIndices->AddPolygon(polygon.release());
    mesh.AddFace(twoIndices.release());
    mesh.AddEdge(makeEdge({}));
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);

    EXPECT_EQ(renderer.getNextTag(), 0u);
    EXPECT_EQ(at({1, 5, KolbaVizCore::Face}).GetChildCount(), 2u) << "the nodes stand, empty";
    double const low[3] = {0, 0, 0}, high[3] = {1, 1, 0};
    EXPECT_EQ(box, VizBox(low, high)) << "the empty edge adds nothing to the box";
}

TEST_F(AVizRendererTest, LineTypeThreeMakesALineSetTheOthersAPolyline) {
    KolbaVizCore::VizWire wire;
    wire.AddEdge(
        makeEdge({0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0}, KolbaVizCore::VizEdge::LineSegments));
    wire.AddEdge(makeEdge({0, 0, 0, 1, 0, 0}, KolbaVizCore::VizEdge::ClosedPolyline));
    wire.AddEdge(nullptr);
    wire.SetHidden(true);
    VizBox box;
    renderer.renderVizWire(wire, box);

    KolbaVizCore::Node const& node = body();
    ASSERT_EQ(node.GetChildCount(), 2u);
    EXPECT_EQ(node.GetChild(0)->GetName(), u"WireEdge");
    EXPECT_EQ(node.GetChild(0)->GetTag(), node.GetChild(1)->GetTag()) << "one id per wire";
    EXPECT_EQ(node.GetChild(0)->GetItem(0)->GetType(), KolbaVizCore::GeometryItem::Type::LineSet);
    EXPECT_EQ(node.GetChild(1)->GetItem(0)->GetType(), KolbaVizCore::GeometryItem::Type::Polyline);
    EXPECT_FALSE(node.IsVisible()) << "a hidden wire hides the node that was current";
}

TEST_F(AVizRendererTest, EveryPointIsAnItemWithATagOfItsOwn) {
    KolbaVizCore::VizPointSet set;
    auto points = std::make_unique<KolbaVizCore::VizPoints>();
    points->SetVertices({1, 2, 3, 4, 5, 6});
    set.AddPoints(points.release());
    VizBox box;
    renderer.renderVizPointSet(set, box);

    KolbaVizCore::Node const& node = *body().GetChild(0);
    EXPECT_EQ(node.GetName(), u"Points");
    ASSERT_EQ(node.GetItemCount(), 2u);
    EXPECT_EQ(node.GetItem(0)->GetTag(), 0u);
    EXPECT_EQ(node.GetItem(1)->GetTag(), 1u);
    double const low[3] = {1, 2, 3}, high[3] = {4, 5, 6};
    EXPECT_EQ(box, VizBox(low, high));
    EXPECT_TRUE(body().IsVisible());
}

TEST_F(AVizRendererTest, TextStandsAtItsAnchorInItsPlaneAndLeavesTheBoxAlone) {
    KolbaVizCore::VizText text;
    float const anchor[3] = {1, 2, 3}, direction[3] = {0, 1, 0}, normal[3] = {0, 0, 1};
    text.SetAnchorPoint(anchor);
    text.SetDirection(direction);
    text.SetNormal(normal);
    text.SetText(u"M8");
    text.SetColor(RGBAColor(0, 0, 255, 255));
    VizBox box;
    renderer.renderVizText(text, box);

    EXPECT_TRUE(box.IsEmpty());
    KolbaVizCore::Node const& node = *body().GetChild(0);
    EXPECT_EQ(node.GetName(), u"Text");
    EXPECT_EQ(node.GetColor(), RGBAColor(0, 0, 255, 255));
    // Rows: direction, normal x direction, normal; translation: the anchor.
    KolbaVizCore::Matrix4 const m = node.GetTransform();
    double const expected[4][4] = {{0, 1, 0, 1}, {-1, 0, 0, 2}, {0, 0, 1, 3}, {0, 0, 0, 1}};
    for (int r = 0; r < 4; ++r)
        for (int c = 0; c < 4; ++c)
            EXPECT_DOUBLE_EQ(m.At(r, c), expected[r][c]) << r << "," << c;
    ASSERT_EQ(node.GetItemCount(), 1u);
    EXPECT_EQ(node.GetItem(0)->GetType(), KolbaVizCore::GeometryItem::Type::Text);
}

TEST_F(AVizRendererTest, WithoutAFactoryNodesStandButNoItemIsMade) {
    scene.builder.SetGeometryItemFactory(nullptr);
    KolbaVizCore::VizMesh mesh;
    mesh.AddFace(makeTriangleFace(0));
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);
    EXPECT_EQ(at({1, 5, KolbaVizCore::Face}).GetChild(0)->GetItemCount(), 0u);
    EXPECT_EQ(renderer.getNextTag(), 0u);
}

TEST_F(AVizRendererTest, ClearBaseForgetsTheBoxButKeepsRadiusAndTags) {
    double const low[3] = {0, 0, 0}, high[3] = {2, 2, 2};
    renderer.setExtents(VizBox(low, high), 3.5f);
    renderer.getNextTag();
    renderer.clearBase();
    float corners[6];
    renderer.GetGeometryBox(corners);
    EXPECT_GT(corners[0], corners[3]) << "an empty box reads low above high";
    EXPECT_FLOAT_EQ(renderer.GetGeometryRadius(), 3.5f);
    EXPECT_EQ(renderer.getNextTag(), 1u);
    WString name;
    renderer.makeNameFromTag(4294967295ul, name);
    EXPECT_EQ(name, u"4294967295");
}

TEST(AVizRendererServices, EachRendererAndEachCopyWorksOnItsOwnClone) {
    ScriptedModeler modeler;
    RenderScene scene;
    {
        ElementRenderer first(&scene.builder, &modeler);
        ElementRenderer second(first);
        ElementRenderer third(&scene.builder, nullptr);
        third = second;
        EXPECT_NE(first.rendererServices(), nullptr);
        EXPECT_NE(first.rendererServices(), &modeler);
        EXPECT_NE(second.rendererServices(), first.rendererServices());
        EXPECT_NE(third.rendererServices(), second.rendererServices());
        EXPECT_EQ(ElementRenderer(&scene.builder, nullptr).rendererServices(), nullptr);
    }
    // The sanitizer build fails here if a clone was freed twice or not at all.
}

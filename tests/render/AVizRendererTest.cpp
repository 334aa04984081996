// What the base of the renderers makes of each kind of loaded element, as scene dumps.
#include "support/RenderFixture.h"
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>

using namespace VizBridgeTarvex;
using KolbaVizCore::Node;
using KolbaVizCore::RGBAColor;

namespace {

using Draw = std::function<void(TarvexRendererProbe&, VizBox&)>;

/// Lets `draw` render into level 5 "Body" below a scene top, and gives the scene's dump, the
/// box the elements added and the next free item tag. The first node ids that
/// Node::GetNextId hands out during the draw read {id}, {id+1}, {id+2}.
std::string drawn(Draw const& draw) {
    RenderScene scene;
    TarvexRendererProbe renderer(nullptr, &scene.builder, nullptr);
    std::uint32_t const first = Node::GetNextId() + 1;
    VizBox box;
    {
        KolbaVizCore::ConstructionContext const construction(&scene.builder);
        KolbaVizCore::SceneContext const top(&scene.builder, Node::RootNodeId, u"ROOT");
        KolbaVizCore::SceneLevelContext const level(&scene.builder, 5, u"Body");
        draw(renderer, box);
    }
    std::string text = scene.builder.Dump() + "box " + boxText(box) + "\nnext tag " +
                       std::to_string(renderer.getNextTag()) + '\n';
    for (std::uint32_t k = 0; k < 3; ++k) {
        std::string const id = std::to_string(first + k);
        std::string const mark = k == 0 ? "{id}" : "{id+" + std::to_string(k) + "}";
        for (std::size_t at = text.find(id); at != std::string::npos; at = text.find(id))
            text.replace(at, id.size(), mark);
    }
    return text;
}

KolbaVizCore::VizPolygon* polygon(std::vector<int> const& offsets,
                                  KolbaVizCore::TriangleType type) {
    auto made = std::make_unique<KolbaVizCore::VizPolygon>();
    made->SetIndices(static_cast<int>(offsets.size()), offsets.data());
    made->SetPolygonType(type);
    return made.release();
}

} // namespace

TEST(AVizRenderer, DrawsEachKindOfElementOnNodesOfItsOwn) {
    EXPECT_EQ(
        drawn([](TarvexRendererProbe& r, VizBox& box) {
            // Faces and edges on entity nodes, coloured by their own colours only; degenerate
            // ones make no item and take no tag. An alpha of -1 or 0 leaves the colours alone.
            KolbaVizCore::VizMesh mesh;
            mesh.AddFace(makeTriangleFace(0));
            mesh.GetFaces()[0]->SetColor(RGBAColor(255, 0, 0, 200));
            mesh.AddFace(makeTriangleFace(2, KolbaVizCore::UndefinedTriangles));
            auto twoIndices = std::make_unique<KolbaVizCore::VizFace>();
            twoIndices->AddPolygon(polygon({0, 3}, KolbaVizCore::Triangles));
            mesh.AddFace(twoIndices.release());
            mesh.AddFace(nullptr);
            mesh.AddFace(makeTriangleFace(4));
            mesh.AddEdge(makeEdge({}));
            mesh.AddEdge(makeEdge({0, 0, 0, 5, 0, 0}));
            r.renderVizMesh(mesh, box, -1);
            // An alpha above 0 replaces the faces' alpha by its low byte; the edges keep theirs.
            std::unique_ptr<KolbaVizCore::VizMesh> const seeThrough(makeMesh(2, 0));
            seeThrough->GetFaces()[0]->SetColor(RGBAColor(10, 20, 30, 200));
            seeThrough->GetEdges()[0]->SetColor(RGBAColor(1, 2, 3, 200));
            r.renderVizMesh(*seeThrough, box, 0x180);
            std::unique_ptr<KolbaVizCore::VizMesh> const unchanged(makeMesh(3, 0));
            unchanged->GetFaces()[0]->SetColor(RGBAColor(7, 7, 7, 100));
            r.renderVizMesh(*unchanged, box, 0);
            // One item a point.
            KolbaVizCore::VizPointSet set;
            auto points = std::make_unique<KolbaVizCore::VizPoints>();
            points->SetVertices({1, 2, 3, 4, 5, 6});
            set.AddPoints(points.release());
            set.AddPoints(nullptr);
            r.renderVizPointSet(set, box);
            // Line segments make a line set, the other edges polylines; hidden, the wire
            // hides the node that is current.
            KolbaVizCore::VizWire wire;
            wire.AddEdge(makeEdge({0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0},
                                  KolbaVizCore::VizEdge::LineSegments));
            wire.AddEdge(makeEdge({0, 0, 0, 1, 0, 0}, KolbaVizCore::VizEdge::ClosedPolyline));
            wire.AddEdge(nullptr);
            wire.SetHidden(true);
            r.renderVizWire(wire, box);
            // A text stands at its anchor in its own plane and adds nothing to the box.
            KolbaVizCore::VizText text;
            float const anchor[3] = {10, 20, 30}, direction[3] = {0, 1, 0}, normal[3] = {0, 0, 1};
            text.SetAnchorPoint(anchor);
            text.SetDirection(direction);
            text.SetNormal(normal);
            text.SetText(u"M8");
            text.SetColor(RGBAColor(0, 0, 255, 255));
            r.renderVizText(text, box);
        }),
        "1 scene \"ROOT\"\n"
        "  5 level \"Body\" hidden\n"
        "    10002 type \"MeshFaces\"\n"
        "      1 entity \"MeshGeometry\" color=255,0,0,200 {polygon#0 mode=1 n=3 c=255,0,0,200}\n"
        "      1 entity \"MeshGeometry\"\n"
        "      1 entity \"MeshGeometry\"\n"
        "      1 entity \"MeshGeometry\" {polygon#1 mode=1 n=3 c=192,192,192,255}\n"
        "      1 entity \"MeshGeometry\" color=10,20,30,128 {polygon#3 mode=1 n=3 c=10,20,30,128}\n"
        "      1 entity \"MeshGeometry\" color=7,7,7,100 {polygon#5 mode=1 n=3 c=7,7,7,100}\n"
        "    10001 type \"MeshEdges\"\n"
        "      2 entity \"MeshGeometry\"\n"
        "      2 entity \"MeshGeometry\" {polyline#2 pts=2 c=0,0,0,255}\n"
        "      2 entity \"MeshGeometry\" color=1,2,3,200 {polyline#4 pts=2 c=1,2,3,200}\n"
        "      2 entity \"MeshGeometry\" {polyline#6 pts=2 c=0,0,0,255}\n"
        "    {id} entity \"Points\" {point#7 at=1,2,3 c=0,0,0,255; point#8 at=4,5,6 c=0,0,0,255}\n"
        "    {id+1} entity \"WireEdge\" {lineset#9 pts=4 c=0,0,0,255}\n"
        "    {id+1} entity \"WireEdge\" {polyline#10 pts=2 c=0,0,0,255}\n"
        "    {id+2} level \"Text\" T=[0 1 0 10; -1 0 0 20; 0 0 1 30] color=0,0,255,255 {text#11 "
        "\"M8\" font=\"\" size=1 c=0,0,255,255}\n"
        "box (0 0 0)-(5 5 6)\nnext tag 12\n");
}

TEST(AVizRenderer, APolygonItemGetsAFlatCopyOfThePointsItsOffsetsName) {
    RenderScene scene;
    KolbaVizCore::ConstructionContext const construction(&scene.builder);
    KolbaVizCore::SceneContext const top(&scene.builder, Node::RootNodeId, u"ROOT");
    TarvexRendererProbe renderer(nullptr, &scene.builder, nullptr);
    KolbaVizCore::VizMesh mesh;
    auto face = std::make_unique<KolbaVizCore::VizFace>();
    float const vertices[12] = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0};
    face->SetVertices(12, vertices);
    face->SetNormals(12, vertices);
    face->AddPolygon(polygon({9, 0, 6, 3, 12}, KolbaVizCore::TriangleFan));
    mesh.AddFace(face.release());
    VizBox box;
    renderer.renderVizMesh(mesh, box, -1);

    auto const& item = dynamic_cast<KolbaVizCore::PolygonItem const&>(
        *scene.builder.FindNode(pathOf({1, KolbaVizCore::Face}))->GetChild(0)->GetItem(0));
    EXPECT_EQ(item.GetMode(), KolbaVizCore::TriangleFan);
    EXPECT_EQ(item.GetIndices(), (std::vector<int>{0, 1, 2, 3, 4}));
    EXPECT_EQ(item.GetVertices(), (std::vector<float>{0, 1, 0, 0, 0, 0, 1, 1, 0, 1, 0, 0, 0, 0, 0}))
        << "an offset past the points reads as the origin";
    EXPECT_EQ(item.GetNormals(), item.GetVertices());
}

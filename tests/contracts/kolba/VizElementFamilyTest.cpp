#include <VizBridge/contracts/kolba/VizContainer.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizWire.h>

#include <gtest/gtest.h>

#include <map>
#include <memory>

using namespace KolbaVizCore;
using VizPort::WString;

namespace {

// Children cross the element interfaces as raw pointers that the parent takes over.
template <class T> T* made(WString const& visualId = WString()) {
    auto element = std::make_unique<T>();
    element->SetVisualID(visualId);
    return element.release();
}

} // namespace

TEST(VizElementFamily, EachElementNamesItsOwnClass) {
    std::unique_ptr<VizElement> const elements[] = {
        std::make_unique<VizMesh>(),     std::make_unique<VizFace>(),
        std::make_unique<VizPolygon>(),  std::make_unique<VizEdge>(),
        std::make_unique<VizWire>(),     std::make_unique<VizPoints>(),
        std::make_unique<VizPointSet>(), std::make_unique<VizText>()};
    std::string const names[] = {"VizMesh", "VizFace",   "VizPolygon",  "VizEdge",
                                 "VizWire", "VizPoints", "VizPointSet", "VizText"};
    std::string const typeIds[] = {VizMesh::TypeID(),     VizFace::TypeID(), VizPolygon::TypeID(),
                                   VizEdge::TypeID(),     VizWire::TypeID(), VizPoints::TypeID(),
                                   VizPointSet::TypeID(), VizText::TypeID()};
    for (std::size_t index = 0; index < std::size(names); ++index) {
        EXPECT_EQ(elements[index]->GetElementType(), names[index]);
        EXPECT_EQ(typeIds[index], names[index]);
    }
}

// Run under the sanitizer build: a child that is not freed, or freed twice, fails there.
TEST(VizElementFamily, ParentsOwnTheirChildrenInTheOrderAdded) {
    auto container = std::make_unique<VizContainer>(3);
    VizMesh* const mesh = made<VizMesh>();
    mesh->SetFaceCountHint(2);
    VizFace* const face = made<VizFace>();
    face->SetPolygonSizeHint(1);
    face->AddPolygon(made<VizPolygon>());
    face->AddPolygon(nullptr);
    mesh->AddFace(face);
    mesh->AddFace(made<VizFace>());
    mesh->SetEdgeCountHint(1);
    mesh->AddEdge(made<VizEdge>());
    VizWire* const wire = made<VizWire>();
    wire->AddEdge(made<VizEdge>());
    VizPointSet* const cloud = made<VizPointSet>();
    cloud->SetPointsCountHint(1);
    cloud->AddPoints(made<VizPoints>());

    container->AddMesh(mesh);
    container->AddCGMesh(made<VizMesh>());
    container->AddWire(wire);
    container->AddCGWire(made<VizWire>());
    container->AddPointSet(cloud);
    container->AddCGPointSet(made<VizPointSet>());
    container->AddMesh(nullptr);

    ASSERT_EQ(container->GetMeshes().size(), 1u);
    EXPECT_EQ(container->GetMeshes()[0], mesh);
    EXPECT_EQ(container->GetCGMeshes().size(), 1u);
    EXPECT_EQ(container->GetWires()[0], wire);
    EXPECT_EQ(container->GetCGWires().size(), 1u);
    EXPECT_EQ(container->GetPointSets()[0], cloud);
    EXPECT_EQ(container->GetCGPointSets().size(), 1u);
    EXPECT_EQ(mesh->GetFaces().front(), face);
    EXPECT_EQ(mesh->GetFaces().size(), 2u);
    EXPECT_EQ(mesh->GetEdges().size(), 1u);
    EXPECT_EQ(face->GetPolygons().size(), 1u) << "null is not kept";
    EXPECT_EQ(wire->GetEdges().size(), 1u);
    EXPECT_EQ(cloud->GetPointSets().size(), 1u);
    container.reset(); // frees the whole tree
}

TEST(VizElementFamily, ArraysAreCopiedAtTheCall) {
    float coordinates[6] = {1, 2, 3, 4, 5, 6};
    int indices[3] = {0, 3, 6};
    VizFace face;
    face.SetVertices(6, coordinates);
    face.SetNormals(3, coordinates + 3);
    VizPolygon polygon;
    polygon.SetIndices(3, indices);
    polygon.SetPolygonType(TriangleFan);
    coordinates[0] = 99;
    indices[0] = 99;
    EXPECT_EQ(face.GetVertices(), (std::vector<float>{1, 2, 3, 4, 5, 6}));
    EXPECT_EQ(face.GetNormals(), (std::vector<float>{4, 5, 6}));
    EXPECT_EQ(polygon.GetIndices(), (std::vector<int>{0, 3, 6}));
    EXPECT_EQ(polygon.GetPolygonType(), TriangleFan);

    face.SetVertices(6, nullptr);
    polygon.SetIndices(3, nullptr);
    EXPECT_TRUE(face.GetVertices().empty());
    EXPECT_TRUE(polygon.GetIndices().empty());
}

TEST(VizMesh, FillsTheVisualIdMapWithItselfAndItsLinkableParts) {
    VizMesh mesh;
    mesh.SetVisualID(u"m1");
    VizFace* const face = made<VizFace>(u"f1");
    VizFace* const shadowing = made<VizFace>(u"m1");
    VizEdge* const edge = made<VizEdge>(u"e1");
    mesh.AddFace(face);
    mesh.AddFace(shadowing);
    mesh.AddFace(made<VizFace>()); // no visual id: nothing can link to it
    mesh.AddEdge(edge);

    VizEdge unrelated;
    std::map<WString, VizElement*> map{{u"f1", &unrelated}, {u"keep", &unrelated}};
    mesh.FillVisuIdMap(map);
    std::map<WString, VizElement*> const expected{
        {u"m1", shadowing}, {u"f1", face}, {u"e1", edge}, {u"keep", &unrelated}};
    EXPECT_EQ(map, expected) << "later entries replace earlier ones; other entries stay";
}

TEST(VizElementFamily, RemovingTransparencyKeepsTheColourState) {
    struct Case {
        bool hasColor;
        std::uint8_t alpha;
    } const cases[] = {{true, 128}, {false, 40}, {true, 255}};
    for (Case const& c : cases) {
        VizEdge edge;
        VizText text;
        edge.SetColorState(c.hasColor, RGBAColor(1, 2, 3, c.alpha));
        text.SetColorState(c.hasColor, RGBAColor(1, 2, 3, c.alpha));
        edge.RemoveTransparency();
        text.RemoveTransparency();
        EXPECT_EQ(edge.GetColor(), RGBAColor(1, 2, 3, 255));
        EXPECT_EQ(text.GetColor(), RGBAColor(1, 2, 3, 255));
        EXPECT_EQ(edge.HasColor(), c.hasColor);
        EXPECT_EQ(text.HasColor(), c.hasColor);
    }
}

TEST(VizText, StartsAtTheOriginInTheXYPlaneWithUnitFontFactors) {
    VizText text;
    EXPECT_EQ(text.GetFontAttrs(), FontAttr());
    EXPECT_EQ(text.GetDirection()[0], 1.0f);
    EXPECT_EQ(text.GetNormal()[2], 1.0f);
    EXPECT_EQ(text.GetAnchorPoint()[0], 0.0f);

    float const anchor[3] = {4, 5, 6};
    text.SetAnchorPoint(anchor);
    text.SetDirection(nullptr);
    text.SetFontSize(3.5f);
    EXPECT_EQ(text.GetAnchorPoint()[2], 6.0f);
    EXPECT_EQ(text.GetDirection()[0], 1.0f) << "a null direction changes nothing";
    EXPECT_EQ(text.GetFontAttrs().size, 3.5f);
    EXPECT_EQ(text.GetFontAttrs().spacing, 1.0f);
}

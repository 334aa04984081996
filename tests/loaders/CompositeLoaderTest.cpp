#include "LoaderTestSupport.h"

#include "support/TarvexVisuTestModel.h"
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/loaders/VizMeshLoader.h>
#include <VizBridge/loaders/VizPointSetLoader.h>
#include <VizBridge/loaders/VizWireLoader.h>

#include <gtest/gtest.h>

#include <array>
#include <stdexcept>
#include <vector>

namespace {

using namespace LoaderTest;
using namespace VizBridgeTarvex;
using KolbaVizCore::VizFace;
using KolbaVizCore::VizMesh;
using KolbaVizCore::VizPointSet;
using KolbaVizCore::VizWire;
using A = std::array<unsigned short, 3>;
using V = std::vector<int>;

TarvexAuthoredVisuEdge EdgeRecord(std::optional<V> indices, std::optional<VizPort::WString> id) {
    return {std::move(id), {0, 0, 0, 1, 1, 1}, std::move(indices), TarvexVisuLine_Polyline, {}, {}};
}

TarvexAuthoredVisuFace FaceRecord(VizPort::WString const& id) {
    return {id,
            u"mech-" + id,
            {0, 0, 0, 1, 0, 0, 0, 1, 0},
            {0, 0, 1, 0, 0, 1, 0, 0, 1},
            {{V{0, 3, 6}, TarvexVisuPolygon_Triangles}, {V{6, 3}, TarvexVisuPolygon_TriangleFan}},
            {},
            {}};
}

TEST(VizMeshLoaderTest, LoadsIdsFacesThenEdgesSkippingEdgesWithoutIndices) {
    TarvexAuthoredVisuMesh record{
        u"mesh",
        u"mesh-mech",
        TarvexVisuGeometry_Standard,
        {FaceRecord(u"f1"), FaceRecord(u"f2")},
        {EdgeRecord(V{0, 3}, u"e1"), EdgeRecord({}, u"lost"), EdgeRecord(V{3}, {})}};
    TarvexVisuMesh const source = Make<TarvexVisuMesh>(record);
    VizMeshLoader loader(source, nullptr, false);
    auto const mesh = LoadAs<VizMesh>(loader);
    ASSERT_NE(mesh, nullptr);
    EXPECT_EQ(mesh->GetVisualID(), u"mesh");
    EXPECT_EQ(mesh->GetMechanicalID(), u"mesh-mech");
    ASSERT_EQ(mesh->GetFaces().size(), 2u);
    VizFace const& face = *mesh->GetFaces()[1];
    EXPECT_EQ(face.GetVisualID(), u"f2");
    EXPECT_EQ(face.GetMechanicalID(), u"mech-f2");
    EXPECT_EQ(face.GetVertices(), record.faces[1].vertices);
    EXPECT_EQ(face.GetNormals(), record.faces[1].normals);
    ASSERT_EQ(face.GetPolygons().size(), 2u);
    EXPECT_EQ(face.GetPolygons()[1]->GetIndices(), (V{6, 3}));
    ASSERT_EQ(mesh->GetEdges().size(), 2u);
    EXPECT_EQ(mesh->GetEdges()[0]->GetMechanicalID(), u"e1");
    EXPECT_EQ(mesh->GetEdges()[1]->GetMechanicalID(), u"");
    EXPECT_EQ(mesh->GetEdges()[1]->GetVertices(), (std::vector<float>{1, 1, 1}));

    TarvexVisuMesh const empty = Make<TarvexVisuMesh>(TarvexAuthoredVisuMesh{});
    VizMeshLoader emptyLoader(empty, nullptr, false);
    auto const emptyMesh = LoadAs<VizMesh>(emptyLoader);
    ASSERT_NE(emptyMesh, nullptr) << "a mesh with nothing in it is still a mesh";
    EXPECT_TRUE(emptyMesh->GetFaces().empty() && emptyMesh->GetEdges().empty());
}

// Faces of a mesh always look up the stack, its edges only when the mesh is asked to inherit.
// Wires and point sets always let their children inherit. No parent takes a colour itself.
TEST(CompositeLoaderColourTest, WhichChildrenInheritTheStackColour) {
    std::vector<TarvexVisuAttributes> stack = Stack({Attributes(A{200, 100, 50}, 128)});
    TarvexAuthoredVisuMesh meshRecord;
    meshRecord.faces = {FaceRecord(u"f")};
    meshRecord.faces[0].alpha = 10;
    meshRecord.edges = {EdgeRecord(V{0}, {})};
    TarvexVisuMesh const meshSource = Make<TarvexVisuMesh>(meshRecord);
    for (bool const inherit : {false, true}) {
        VizMeshLoader loader(meshSource, &stack, inherit);
        auto const mesh = LoadAs<VizMesh>(loader);
        ASSERT_NE(mesh, nullptr);
        EXPECT_FALSE(mesh->HasColor());
        EXPECT_EQ(mesh->GetFaces().at(0)->GetColor(), Found(A{200, 100, 50}, 10));
        EXPECT_EQ(mesh->GetEdges().at(0)->HasColor(), inherit);
    }

    TarvexVisuWire const wireSource = Make<TarvexVisuWire>(TarvexAuthoredVisuWire{
        u"wire", TarvexVisuGeometry_Standard, {EdgeRecord(V{3, 0}, {}), EdgeRecord({}, {})}});
    VizWireLoader wireLoader(wireSource, &stack, false);
    auto const wire = LoadAs<VizWire>(wireLoader);
    ASSERT_NE(wire, nullptr);
    EXPECT_EQ(wire->GetVisualID(), u"wire");
    EXPECT_FALSE(wire->HasColor());
    ASSERT_EQ(wire->GetEdges().size(), 1u) << "the edge without indices is left out";
    EXPECT_EQ(wire->GetEdges()[0]->GetColor(), Found(A{200, 100, 50}, 128));

    TarvexAuthoredVisuPointSet setRecord;
    setRecord.points = {{{1, 2, 3}, V{0}, {}, 7}, {{1, 2, 3}, {}, {}, {}}};
    TarvexVisuPointSet const setSource = Make<TarvexVisuPointSet>(setRecord);
    VizPointSetLoader setLoader(setSource, &stack, false);
    auto const set = LoadAs<VizPointSet>(setLoader);
    ASSERT_NE(set, nullptr);
    EXPECT_FALSE(set->HasColor());
    ASSERT_EQ(set->GetPointSets().size(), 1u);
    EXPECT_EQ(set->GetPointSets()[0]->GetColor(), Found(A{200, 100, 50}, 7));
}

// As the import runs them: an imported mesh loads alike twice, and a fault of the import
// library halfway through passes through and leaves nothing behind.
TEST(CompositeLoaderRunTest, ImportedMeshLoadsAlikeTwiceAndAFaultPassesThrough) {
    TarvexVisuTestModel test;
    TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
    node.type = TarvexVisuNode::VisuMesh;
    node.mesh.faces = {FaceRecord(u"f1"), FaceRecord(u"f2")};
    node.mesh.edges = {EdgeRecord(V{0, 3}, {}), EdgeRecord(V{3, 0}, {})};
    TarvexVisuMesh const source = test.Nodes().at(0).GetMesh();
    std::vector<TarvexVisuAttributes> stack;

    VizMeshLoader loader(source, &stack, false);
    auto const first = LoadAs<VizMesh>(loader);
    auto const second = LoadAs<VizMesh>(loader);
    ASSERT_TRUE(first && second);
    EXPECT_NE(first.get(), second.get());
    ASSERT_EQ(second->GetEdges().size(), 2u);
    EXPECT_EQ(second->GetEdges()[1]->GetVertices(), first->GetEdges()[1]->GetVertices());

    TarvexFault fault;
    fault.operation = "TarvexVisuEdge::GetLineIndices";
    fault.skip = 1;
    test.model.Faults().Add(fault);
    EXPECT_THROW(loader.Load(), std::runtime_error);
    test.model.Faults().Clear();
    auto const third = LoadAs<VizMesh>(loader);
    ASSERT_NE(third, nullptr);
    EXPECT_EQ(third->GetEdges().size(), 2u);
}

} // namespace

#include "TarvexTestText.h"
#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPolicy.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointsIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <stdexcept>
#include <vector>

namespace {

std::vector<float> FloatsOf(int count, float const* values) {
    return values == nullptr ? std::vector<float>() : std::vector<float>(values, values + count);
}

std::optional<std::vector<int>> IndicesOf(int count, int const* indices) {
    if (indices == nullptr) {
        return std::nullopt;
    }
    return std::vector<int>(indices, indices + count);
}

std::vector<std::u16string> Ids(TarvexVisuIDIter iterator) {
    std::vector<std::u16string> ids;
    for (TarvexWString const& id : Items(iterator)) {
        ids.push_back(id.ToWString());
    }
    return ids;
}

TEST(TarvexVisuDataTest, GivesTheFlatNodeListInOrderWithTheUnit) {
    TarvexVisuTestModel test;
    test.Visu().unit = TarvexLengthUnit_Inch;
    using Node = TarvexVisuNode;
    for (auto const& [type, leaf] : {std::pair{Node::VisuGroup, false},
                                     {Node::VisuMesh, true},
                                     {Node::VisuWire, true},
                                     {Node::VisuRoughness, true},
                                     {static_cast<Node::TarvexVisuNodeType>(99), true}}) {
        TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
        node.type = type;
        node.leaf = leaf;
    }
    TarvexVisuData const data = test.Import();
    EXPECT_EQ(data.GetUnits(), TarvexLengthUnit_Inch);
    EXPECT_EQ(data.GetNodeIterator().GetCount(), 5);
    std::vector<int> types;
    std::vector<bool> leaves;
    for (TarvexVisuNode const& node : test.Nodes()) {
        types.push_back(node.GetType());
        leaves.push_back(node.IsLeaf());
    }
    EXPECT_EQ(types, (std::vector<int>{2, 5, 7, 57, 99}));
    EXPECT_EQ(leaves, (std::vector<bool>{false, true, true, true, true}));
}

TEST(TarvexVisuDataTest, AMeshReadsBackFacesPolygonsAndEdges) {
    TarvexVisuTestModel test;
    TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
    node.type = TarvexVisuNode::VisuMesh;
    node.mesh.geometryType = TarvexVisuGeometry_FTAConstructed;
    node.mesh.faces.push_back({u"f1",
                               std::nullopt,
                               {0, 0, 0, 1, 0, 0, 0, 1, 0},
                               {0, 0, 1, 0, 0, 1, 0, 0, 1},
                               {{{{0, 3, 6}}, TarvexVisuPolygon_TriangleFan}, {std::nullopt}},
                               {},
                               {}});
    node.mesh.edges.push_back(
        {u"e1", {0, 0, 0, 5, 5, 5}, {{3, 0}}, TarvexVisuLine_ClosedPolyline, {}, {}});
    node.mesh.edges.push_back(
        {std::nullopt, {}, std::vector<int>{}, TarvexVisuLine_Segments, {}, {}});

    TarvexVisuMesh const mesh = test.Nodes().at(0).GetMesh();
    EXPECT_EQ(mesh.GetGeometryType(), TarvexVisuGeometry_FTAConstructed);

    std::vector<TarvexVisuFace> const faces = Items(mesh.GetFaceIterator());
    ASSERT_EQ(faces.size(), 1u);
    TarvexWString id;
    ASSERT_TRUE(faces[0].GetID(id));
    EXPECT_EQ(TextOf(id), u"f1");
    float const* floats = nullptr;
    int count = faces[0].GetVertices(floats);
    EXPECT_EQ(FloatsOf(count, floats), (std::vector<float>{0, 0, 0, 1, 0, 0, 0, 1, 0}));
    count = faces[0].GetNormals(floats);
    EXPECT_EQ(FloatsOf(count, floats), (std::vector<float>{0, 0, 1, 0, 0, 1, 0, 0, 1}));
    std::vector<TarvexVisuPolygon> const polygons = Items(faces[0].GetPolygonIterator());
    ASSERT_EQ(polygons.size(), 2u);
    int const* indices = nullptr;
    TarvexVisuPolygonType polygonType = TarvexVisuPolygon_Unknown;
    count = polygons[0].GetPolygonIndices(indices, polygonType);
    EXPECT_EQ(IndicesOf(count, indices), (std::vector<int>{0, 3, 6}));
    EXPECT_EQ(polygonType, TarvexVisuPolygon_TriangleFan);
    // An absent index array reads as null, so that a reader can tell it from an empty one.
    EXPECT_EQ(polygons[1].GetPolygonIndices(indices, polygonType), 0);
    EXPECT_EQ(indices, nullptr);
    EXPECT_EQ(polygonType, TarvexVisuPolygon_Triangles);

    std::vector<TarvexVisuEdge> const edges = Items(mesh.GetEdgeIterator());
    ASSERT_EQ(edges.size(), 2u);
    ASSERT_TRUE(edges[0].GetMechanicalID(id));
    EXPECT_EQ(TextOf(id), u"e1");
    count = edges[0].GetPoints(floats);
    EXPECT_EQ(FloatsOf(count, floats), (std::vector<float>{0, 0, 0, 5, 5, 5}));
    TarvexVisuLineType lineType = TarvexVisuLine_Unknown;
    count = edges[0].GetLineIndices(indices, lineType);
    EXPECT_EQ(IndicesOf(count, indices), (std::vector<int>{3, 0}));
    EXPECT_EQ(lineType, TarvexVisuLine_ClosedPolyline);
    EXPECT_EQ(edges[1].GetLineIndices(indices, lineType), 0);
    EXPECT_NE(indices, nullptr) << "a present, empty index array";
    EXPECT_EQ(lineType, TarvexVisuLine_Segments);
}

TEST(TarvexVisuDataTest, WiresAndPointSetsReadBack) {
    TarvexVisuTestModel test;
    TarvexAuthoredVisuNode& wireNode = test.Visu().nodes.emplace_back();
    wireNode.type = TarvexVisuNode::VisuWire;
    wireNode.wire = {u"w", TarvexVisuGeometry_Constructed, {{}, {}}};
    TarvexAuthoredVisuNode& setNode = test.Visu().nodes.emplace_back();
    setNode.type = TarvexVisuNode::VisuPointSet;
    setNode.pointSet.points.push_back({{1, 2, 3, 4, 5, 6}, {{3}}, {}, {}});
    setNode.pointSet.points.push_back({});

    std::vector<TarvexVisuNode> const nodes = test.Nodes();
    TarvexVisuWire const wire = nodes.at(0).GetWire();
    EXPECT_EQ(wire.GetGeometryType(), TarvexVisuGeometry_Constructed);
    EXPECT_EQ(wire.GetEdgeIterator().GetCount(), 2);

    TarvexVisuPointSet const set = nodes.at(1).GetPointSet();
    EXPECT_EQ(set.GetGeometryType(), TarvexVisuGeometry_Standard);
    std::vector<TarvexVisuPoints> const points = Items(set.GetPointsIterator());
    ASSERT_EQ(points.size(), 2u);
    float const* floats = nullptr;
    int const* indices = nullptr;
    int count = points[0].GetPoints(floats);
    EXPECT_EQ(FloatsOf(count, floats), (std::vector<float>{1, 2, 3, 4, 5, 6}));
    count = points[0].GetPointIndices(indices);
    EXPECT_EQ(IndicesOf(count, indices), (std::vector<int>{3}));
    count = points[1].GetPointIndices(indices);
    EXPECT_EQ(IndicesOf(count, indices), std::nullopt);

    // What a node was not given is empty.
    EXPECT_EQ(nodes.at(0).GetMesh().GetFaceIterator().GetCount(), 0);
    EXPECT_EQ(nodes.at(1).GetPMI().GetTextIterator().GetCount(), 0);
}

TEST(TarvexVisuDataTest, APMIReadsBackItsTextsFontsAndLinks) {
    TarvexVisuTestModel test;
    TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
    node.type = TarvexVisuNode::VisuDimensionLength;
    node.attributes.font = TarvexAuthoredVisuFont{u"Courier", 3.0f, std::nullopt, std::nullopt};
    node.pmi.displayName = u"Length 1";
    node.pmi.edges.resize(3);
    node.pmi.texts.push_back({u"12.5", {1, 2, 3}, {0, 1, 0}, {1, 0, 0}, std::nullopt, {}, {}});
    node.pmi.texts.push_back({});
    node.pmi.linkedElements.push_back({{}, 4, u"face-4", true});
    node.pmi.linkedElements.push_back({{1}, 5, u"face-5", true});

    TarvexVisuNode const read = test.Nodes().at(0);
    TarvexVisuPMI const pmi = read.GetPMI();
    EXPECT_EQ(TextOf(pmi.GetDisplayName()), u"Length 1");
    EXPECT_EQ(pmi.GetEdgeIterator().GetCount(), 3);

    TarvexVisuFont font;
    ASSERT_TRUE(read.GetAttributes().GetFont(font));
    EXPECT_EQ(TextOf(font.GetFontName()), u"Courier");
    float height = 0;
    EXPECT_TRUE(font.GetTextHeight(height));
    EXPECT_EQ(height, 3.0f);

    std::vector<TarvexVisuText> const texts = Items(pmi.GetTextIterator());
    ASSERT_EQ(texts.size(), 2u);
    float anchor[3], direction[3], normal[3];
    EXPECT_EQ(TextOf(texts[0].GetTextString(anchor, direction, normal)), u"12.5");
    EXPECT_EQ(std::vector<float>(anchor, anchor + 3), (std::vector<float>{1, 2, 3}));
    EXPECT_EQ(std::vector<float>(direction, direction + 3), (std::vector<float>{0, 1, 0}));
    EXPECT_EQ(std::vector<float>(normal, normal + 3), (std::vector<float>{1, 0, 0}));
    // A text without a string still places itself, so that its arrays are never left unset.
    EXPECT_EQ(TextOf(texts[1].GetTextString(anchor, direction, normal)), std::nullopt);
    EXPECT_EQ(std::vector<float>(direction, direction + 3), (std::vector<float>{1, 0, 0}));

    // Only an entity of the part itself is a part entity; one below an instance is not.
    std::vector<TarvexEntity> const linked = Items(pmi.GetLinkedElementIterator());
    ASSERT_EQ(linked.size(), 2u);
    TarvexVisuEntity part;
    ASSERT_TRUE(linked[0].GetPartEntity(part));
    TarvexWString id;
    ASSERT_TRUE(part.GetID(id));
    EXPECT_EQ(TextOf(id), u"face-4");
    EXPECT_FALSE(linked[1].GetPartEntity(part));
}

TEST(TarvexVisuDataTest, ViewsAndCapturesReadBack) {
    TarvexVisuTestModel test;
    test.Visu().views.push_back(
        {std::nullopt, u"Front", u"v1", std::nullopt, std::nullopt, {u"a1", u"a2"}});
    TarvexAuthoredVisuCapture& capture = test.Visu().captures.emplace_back();
    capture.displayName = u"Capture 1";
    capture.hiddenText = u"";
    capture.camera = {TarvexVisuCamera::CameraOrthographic, std::nullopt, 30.0f, 2.5f};
    capture.annotationIds = {u"a1"};
    capture.ftaConstructedGeometryIds = {u"cg1", u"cg2"};
    capture.managesGeometry = true;
    capture.bodies.push_back({{1}, 0, u"body", true});

    TarvexVisuData const data = test.Import();
    std::vector<TarvexVisuView> const views = Items(data.GetViewIterator());
    ASSERT_EQ(views.size(), 1u);
    EXPECT_EQ(TextOf(views[0].GetDisplayName()), u"Front");
    EXPECT_EQ(Ids(views[0].GetAnnotationIDIterator()), (std::vector<std::u16string>{u"a1", u"a2"}));

    std::vector<TarvexVisuCapture> const captures = Items(data.GetCaptureIterator());
    ASSERT_EQ(captures.size(), 1u);
    EXPECT_EQ(TextOf(captures[0].GetDisplayName()), u"Capture 1");
    EXPECT_EQ(TextOf(captures[0].GetHiddenText()), u"");
    TarvexVisuCamera const camera = captures[0].GetCamera();
    EXPECT_EQ(camera.GetType(), TarvexVisuCamera::CameraOrthographic);
    EXPECT_EQ(camera.GetPerspectiveViewAngle(), 30.0f);
    EXPECT_EQ(camera.GetOrthographicZoomFactor(), 2.5f);
    EXPECT_EQ(Ids(captures[0].GetAnnotationIDIterator()), (std::vector<std::u16string>{u"a1"}));
    EXPECT_EQ(Ids(captures[0].GetFTACGIDIterator()), (std::vector<std::u16string>{u"cg1", u"cg2"}));
    EXPECT_TRUE(captures[0].GetManagesGeometry());
    EXPECT_EQ(captures[0].GetBodyIDIterator().GetCount(), 1);
    EXPECT_EQ(TextOf(TarvexVisuCapture().GetHiddenText()), std::nullopt);
    EXPECT_EQ(TarvexVisuCapture().GetCamera().GetType(), TarvexVisuCamera::CameraUnknown);
}

TEST(TarvexVisuDataTest, AnImportKeepsItsOwnCopyWhichOutlivesTheModel) {
    std::optional<TarvexVisuData> kept;
    {
        TarvexVisuTestModel test;
        test.Visu().nodes.resize(2);
        kept = test.Import();
        // Authoring after the import, also enough to move the node list, is not seen by it.
        test.Visu().nodes.resize(100);
        test.Visu().nodes[0].type = TarvexVisuNode::VisuMesh;
        EXPECT_EQ(test.Import().GetNodeIterator().GetCount(), 100);
    }
    std::vector<TarvexVisuNode> const nodes = Items(kept->GetNodeIterator());
    ASSERT_EQ(nodes.size(), 2u);
    EXPECT_EQ(nodes[0].GetType(), TarvexVisuNode::VisuUnknown);
}

TEST(TarvexVisuDataTest, IteratorsWantNextBeforeCurrentAndStopAtTheEnd) {
    TarvexVisuTestModel test;
    test.Visu().views.push_back({std::nullopt, u"only", {}, {}, {}, {}});
    TarvexVisuViewIter views = test.Import().GetViewIterator();
    EXPECT_EQ(TextOf(views.Current().GetDisplayName()), std::nullopt);
    ASSERT_TRUE(views.Next());
    EXPECT_EQ(TextOf(views.Current().GetDisplayName()), u"only");
    EXPECT_FALSE(views.Next());
    EXPECT_FALSE(views.Next());
    EXPECT_EQ(TextOf(views.Current().GetDisplayName()), std::nullopt);
    EXPECT_EQ(views.GetCount(), 1);

    TarvexVisuNodeIter empty;
    EXPECT_EQ(empty.GetCount(), 0);
    EXPECT_FALSE(empty.Next());
    EXPECT_EQ(TarvexVisuData().GetNodeIterator().GetCount(), 0);
    EXPECT_EQ(TarvexVisuData().GetUnits(), TarvexLengthUnit_Unknown);
    EXPECT_EQ(TarvexVisuImportResult().GetVisualizationData().GetCaptureIterator().GetCount(), 0);
}

TEST(TarvexVisuImporterTest, LogsEachImportAndRejectsADocumentOfNoModel) {
    TarvexVisuTestModel test;
    TarvexVisualizationImporter const importer;
    importer.Import(test.Document());
    importer.ImportWithPolicy(TarvexPolicy(), test.Document());
    EXPECT_EQ(
        test.model.GetImportCalls(),
        (std::vector<TarvexImportCall>{{"TarvexVisualizationImporter::Import", 20},
                                       {"TarvexVisualizationImporter::ImportWithPolicy", 20}}));
    EXPECT_THROW(importer.Import(TarvexPartDocument()), std::invalid_argument);
    EXPECT_THROW(importer.ImportWithPolicy(TarvexPolicy(), TarvexPartDocument()),
                 std::invalid_argument);
}

TEST(TarvexVisuImporterTest, RefusesIndicesThatReachPastTheirCoordinates) {
    std::vector<std::function<void(TarvexAuthoredVisuNode&)>> const spoilers{
        [](TarvexAuthoredVisuNode& n) {
            n.mesh.edges.push_back({{}, {0, 0, 0}, {{1}}, {}, {}, {}});
        },
        [](TarvexAuthoredVisuNode& n) {
            n.wire.edges.push_back({{}, {0, 0, 0}, {{-3}}, {}, {}, {}});
        },
        [](TarvexAuthoredVisuNode& n) {
            n.pmi.edges.push_back({{}, {}, {{0}}, {}, {}, {}});
        },
        [](TarvexAuthoredVisuNode& n) {
            n.pointSet.points.push_back({{0, 0, 0}, {{3}}, {}, {}});
        },
        [](TarvexAuthoredVisuNode& n) {
            // Vertices enough, normals not.
            n.mesh.faces.push_back({{}, {}, {0, 0, 0, 1, 1, 1}, {0, 0, 1}, {{{{0, 3}}}}, {}, {}});
        },
    };
    for (auto const& spoil : spoilers) {
        TarvexVisuTestModel test;
        spoil(test.Visu().nodes.emplace_back());
        EXPECT_THROW(test.Import(), std::invalid_argument);
    }
}

TEST(TarvexVisuEntityTest, DescendsToThePartEntityThroughInstances) {
    TarvexModel model;
    model.AddAssembly(10, u"Top");
    model.AddPart(20, u"Bolt");
    model.AddRootInstance(10, u"Top.1");
    model.AddInstance(10, 20, u"Bolt.1");
    TarvexEntity const body = model.MakeEntity(TarvexAuthoredEntity{{1, 2}, 7, u"body-7", true});

    std::vector<std::u16string> names;
    TarvexEntity current = body;
    TarvexInstanceEntity instance;
    TarvexVisuEntity part;
    while (!current.GetPartEntity(part) && current.GetInstanceEntity(instance)) {
        names.push_back(instance.GetInstance().GetInstanceName().ToWString());
        current = instance.GetEntity();
    }
    EXPECT_EQ(names, (std::vector<std::u16string>{u"Top.1", u"Bolt.1"}));
    TarvexWString id;
    ASSERT_TRUE(part.GetID(id));
    EXPECT_EQ(TextOf(id), u"body-7");
    TarvexEntity self;
    ASSERT_TRUE(current.GetPartEntity(self));
    EXPECT_EQ(self.GetEntityId(), 7u);

    // An entity that ends in no part is neither kind at the end of its path.
    TarvexEntity const nowhere = model.MakeEntity(TarvexAuthoredEntity{{1}, 0, u"x", false});
    ASSERT_TRUE(nowhere.GetInstanceEntity(instance));
    TarvexEntity const end = instance.GetEntity();
    EXPECT_FALSE(end.GetPartEntity(part));
    EXPECT_FALSE(end.GetInstanceEntity(instance));
    EXPECT_FALSE(TarvexEntity().GetPartEntity(part));
}

} // namespace

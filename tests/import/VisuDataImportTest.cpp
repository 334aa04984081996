#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include "support/VizBuilderTestPeer.h"
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

using namespace VizBridgeTarvex;
using KolbaVizCore::VizMesh;
using KolbaVizCore::VizPMI;
using Node = TarvexVisuNode;

namespace {

constexpr unsigned int kBracket = 20;
constexpr unsigned int kCover = 30;

TarvexAuthoredVisuFace triangleFace(char16_t const* id, char16_t const* mechanicalId) {
    TarvexAuthoredVisuFace face;
    face.id = id;
    face.mechanicalId = mechanicalId;
    face.vertices = {0, 0, 0, 1, 0, 0, 0, 1, 0};
    face.normals = {0, 0, 1, 0, 0, 1, 0, 0, 1};
    TarvexAuthoredVisuPolygon polygon;
    polygon.indices = std::vector<int>{0, 3, 6};
    face.polygons.push_back(polygon);
    return face;
}

TarvexAuthoredVisuNode meshNode(char16_t const* id, TarvexVisuGeometryType geometry) {
    TarvexAuthoredVisuNode node;
    node.type = Node::VisuMesh;
    node.mesh.id = id;
    node.mesh.mechanicalId = std::u16string(u"M-") + id;
    node.mesh.geometryType = geometry;
    node.mesh.faces.push_back(
        triangleFace((std::u16string(id) + u"/f").c_str(), (std::u16string(u"F-") + id).c_str()));
    return node;
}

TarvexAuthoredVisuNode pmiNode(char16_t const* id, std::vector<char16_t const*> links = {}) {
    TarvexAuthoredVisuNode node;
    node.type = Node::VisuNote;
    node.pmi.id = id;
    node.pmi.mechanicalId = std::u16string(u"P-") + id;
    TarvexAuthoredVisuEdge leader;
    leader.points = {0, 0, 0, 5, 5, 0};
    leader.lineIndices = std::vector<int>{0, 3};
    node.pmi.edges.push_back(leader);
    for (char16_t const* link : links) {
        TarvexAuthoredEntity entity;
        entity.visualId = link;
        node.pmi.linkedElements.push_back(entity);
    }
    return node;
}

/// Parts Bracket (20) and Cover (30), each placed once; the test fills their data.
struct VisuImport {
    VisuImport() {
        model.AddPart(kBracket, u"Bracket");
        model.AddPart(kCover, u"Cover");
        model.AddRootInstance(kBracket, u"Bracket.1");
        model.AddRootInstance(kCover, u"Cover.1");
    }
    TarvexAuthoredVisuData& visu(unsigned int id) { return model.FindReference(id)->visu; }
    void run(bool importVisu, bool importPMI, bool tesselateText = false) {
        structure = buildStructure(model);
        structure->SetTesselatingText(tesselateText);
        input = model.GetInputProductStructure();
        VizBuilder builder(*structure, input, nullptr);
        builder.SetImportVisu(importVisu);
        builder.SetImportPMI(importPMI);
        builder.ImportAndBuildPS();
    }
    TarvexModel model;
    std::unique_ptr<VizProductStructure> structure;
    TarvexInputProductStructure input;
};

} // namespace

TEST(VisuDataImport, TheSwitchesChooseTheContainers) {
    struct Case {
        bool visu, pmi;
        bool vizContainer, pmiContainer;
    };
    // PMI alone goes the BREP road, which reads visualisation data only for parts with
    // semantic PMI; that road is tested with the semantic PMI import.
    for (Case const c : {Case{true, true, true, true}, Case{true, false, true, false}}) {
        SCOPED_TRACE(std::to_string(c.visu) + std::to_string(c.pmi));
        VisuImport v;
        v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard), pmiNode(u"n1")};
        v.run(c.visu, c.pmi);
        EXPECT_EQ(v.structure->GetVizContainer(kBracket) != nullptr, c.vizContainer);
        EXPECT_EQ(v.structure->GetVizPMIContainer(kBracket) != nullptr, c.pmiContainer);
        EXPECT_TRUE(v.structure->IsVizLoaded(kBracket));
        EXPECT_TRUE(v.structure->GetErrorMessages().empty());
        if (c.pmiContainer) {
            EXPECT_EQ(v.structure->GetVizPMIContainer(kBracket)->GetVizPMIs().size(), 1u);
        }
    }
}

TEST(VisuDataImport, GeometryTypesChooseTheLists) {
    struct Case {
        TarvexVisuGeometryType type;
        bool visu, pmi;
        std::size_t meshes, cgMeshes, ftaMeshes;
    };
    for (Case const c : {Case{TarvexVisuGeometry_Standard, true, true, 1, 0, 0},
                         Case{TarvexVisuGeometry_Unknown, true, true, 1, 0, 0},
                         Case{TarvexVisuGeometry_Constructed, true, true, 0, 1, 0},
                         Case{TarvexVisuGeometry_FTAConstructed, true, true, 0, 0, 1},
                         Case{TarvexVisuGeometry_FTAConstructed, true, false, 0, 0, 0}}) {
        SCOPED_TRACE(std::to_string(c.type) + std::to_string(c.visu) + std::to_string(c.pmi));
        VisuImport v;
        v.visu(kBracket).nodes = {meshNode(u"m1", c.type)};
        v.run(c.visu, c.pmi);
        VizContainer const* viz = v.structure->GetVizContainer(kBracket);
        VizPMIContainer const* pmi = v.structure->GetVizPMIContainer(kBracket);
        EXPECT_EQ(viz ? viz->GetMeshes().size() : 0u, c.meshes);
        EXPECT_EQ(viz ? viz->GetCGMeshes().size() : 0u, c.cgMeshes);
        EXPECT_EQ(pmi ? pmi->GetVizFTACGMeshes().size() : 0u, c.ftaMeshes);
    }
}

TEST(VisuDataImport, TheNodesOwnAttributesReachItsTopElement) {
    VisuImport v;
    TarvexAuthoredVisuNode alphaOnly = meshNode(u"m1", TarvexVisuGeometry_Standard);
    alphaOnly.attributes.alpha = 0x1280; // only the low byte counts
    alphaOnly.attributes.hidden = false;
    TarvexAuthoredVisuNode coloured = meshNode(u"m2", TarvexVisuGeometry_Standard);
    coloured.attributes.rgb = std::array<unsigned short, 3>{10, 20, 0x130};
    coloured.attributes.hidden = true;
    v.visu(kBracket).nodes = {alphaOnly, coloured, meshNode(u"m3", TarvexVisuGeometry_Standard)};
    v.run(true, false);
    auto const& meshes = v.structure->GetVizContainer(kBracket)->GetMeshes();
    ASSERT_EQ(meshes.size(), 3u);
    EXPECT_TRUE(meshes[0]->HasColor());
    EXPECT_EQ(meshes[0]->GetColor(),
              RGBAColor(RGBAColor().red, RGBAColor().green, RGBAColor().blue, 0x80));
    EXPECT_FALSE(meshes[0]->GetHidden());
    EXPECT_EQ(meshes[1]->GetColor(), RGBAColor(10, 20, 0x30, 255));
    EXPECT_TRUE(meshes[1]->GetHidden());
    EXPECT_FALSE(meshes[2]->HasColor()) << "no attributes of its own: the loader's colour stays";
}

// Faces look up the stack for their colour, so they show which attributes it holds.
TEST(VisuDataImport, AGroupsAttributesStayForTheRestOfTheWalkALeafsOnlyForItself) {
    VisuImport v;
    TarvexAuthoredVisuNode group;
    group.type = Node::VisuGroup;
    group.leaf = false;
    group.attributes.rgb = std::array<unsigned short, 3>{200, 0, 0};
    TarvexAuthoredVisuNode notALeaf = meshNode(u"skipped", TarvexVisuGeometry_Standard);
    notALeaf.leaf = false;
    TarvexAuthoredVisuNode green = meshNode(u"m2", TarvexVisuGeometry_Standard);
    green.attributes.rgb = std::array<unsigned short, 3>{0, 200, 0};
    v.visu(kBracket).nodes = {group, meshNode(u"m1", TarvexVisuGeometry_Standard), green,
                              meshNode(u"m3", TarvexVisuGeometry_Standard), notALeaf};
    v.run(true, false);
    auto const& meshes = v.structure->GetVizContainer(kBracket)->GetMeshes();
    ASSERT_EQ(meshes.size(), 3u) << "a mesh node that is no leaf makes nothing";
    RGBAColor const red(200, 0, 0, 255), greenColour(0, 200, 0, 255);
    EXPECT_EQ(meshes[0]->GetFaces()[0]->GetColor(), red);
    EXPECT_EQ(meshes[1]->GetFaces()[0]->GetColor(), greenColour);
    EXPECT_EQ(meshes[2]->GetFaces()[0]->GetColor(), red) << "the leaf's colour left with it";
}

TEST(VisuDataImport, PMILinksResolveToMechanicalIdsAfterTheWholeWalk) {
    struct Case {
        bool visu;
        std::vector<std::u16string> mechanicalIds;
    };
    for (Case const& c : {Case{true, {u"F-m1", u"P-n2", u""}}}) {
        SCOPED_TRACE(c.visu);
        VisuImport v;
        // n1 links the face of m1, the PMI n2 that comes after it, and an unknown id.
        v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard),
                                  pmiNode(u"n1", {u"m1/f", u"n2", u"nowhere"}), pmiNode(u"n2")};
        v.run(c.visu, true);
        auto const& pmis = v.structure->GetVizPMIContainer(kBracket)->GetVizPMIs();
        ASSERT_EQ(pmis.size(), 2u);
        std::vector<std::u16string> const got = pmis[0]->GetLinkedEntityMechIDs();
        EXPECT_EQ(got, c.mechanicalIds);
        EXPECT_TRUE(pmis[1]->GetLinkedEntityMechIDs().empty()) << "no links: an empty list";
    }
}

TEST(VisuDataImport, TheStructuresTextSwitchKeepsTextsOrTessellatesThem) {
    for (bool const tesselate : {false, true}) {
        SCOPED_TRACE(tesselate);
        VisuImport v;
        TarvexAuthoredVisuNode note = pmiNode(u"n1");
        TarvexAuthoredVisuText text;
        text.text = u"AB";
        text.font = TarvexAuthoredVisuFont{u"DejaVu Sans", 5.0f, 1.0f, 1.0f};
        note.pmi.texts.push_back(text);
        v.visu(kBracket).nodes = {note};
        v.run(true, true, tesselate);

        auto const& pmis = v.structure->GetVizPMIContainer(kBracket)->GetVizPMIs();
        ASSERT_EQ(pmis.size(), 1u);
        if (tesselate) {
            EXPECT_TRUE(pmis[0]->GetTexts().empty());
            EXPECT_GT(pmis[0]->GetEdges().size(), 1u) << "the leader, then the glyph outlines";
            EXPECT_EQ(pmis[0]->GetFaces().size(), 2u) << "one filled glyph per letter";
        } else {
            ASSERT_EQ(pmis[0]->GetTexts().size(), 1u);
            EXPECT_EQ(pmis[0]->GetTexts()[0]->GetText(), u"AB");
            EXPECT_EQ(pmis[0]->GetEdges().size(), 1u);
            EXPECT_TRUE(pmis[0]->GetFaces().empty());
        }
    }
}

// The roads that import PMI without tessellated geometry call these steps directly.
TEST(VisuDataImport, WithPMIAloneOnlyPMIAndTheirConstructedGeometryAreLoaded) {
    VisuImport v;
    v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard),
                              meshNode(u"m2", TarvexVisuGeometry_Constructed),
                              meshNode(u"m3", TarvexVisuGeometry_FTAConstructed), pmiNode(u"n1")};
    v.structure = buildStructure(v.model);
    v.input = v.model.GetInputProductStructure();
    VizBuilder builder(*v.structure, v.input, nullptr);
    builder.SetImportPMI(true);
    TarvexPartDocument const document = v.input.GetReferenceFromId(kBracket).GetDocument();
    TarvexVisuData const data =
        TarvexVisualizationImporter().Import(document).GetVisualizationData();

    VizContainer* viz = nullptr;
    VizPMIContainer* pmi = nullptr;
    VizBuilderTestPeer::graphicalContainer(builder, kBracket, data, viz, pmi);
    std::unique_ptr<VizPMIContainer> const owned(pmi);
    EXPECT_EQ(viz, nullptr);
    ASSERT_NE(pmi, nullptr);
    ASSERT_EQ(pmi->GetVizFTACGMeshes().size(), 1u);
    EXPECT_EQ(pmi->GetVizFTACGMeshes()[0]->GetVisualID(), u"m3");
    EXPECT_EQ(pmi->GetVizPMIs().size(), 1u);
    EXPECT_EQ(VizBuilderTestPeer::element(builder, u"n1"), pmi->GetVizPMIs()[0]);
    for (char16_t const* id : {u"m1/f", u"m3/f"})
        EXPECT_EQ(VizBuilderTestPeer::element(builder, id), nullptr) << "no mesh ids without a "
                                                                        "VizContainer";
}

TEST(VisuDataImport, WithNeitherSwitchNothingIsFiledAndTheReferenceIsNamed) {
    VisuImport v;
    v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard)};
    v.structure = buildStructure(v.model);
    v.input = v.model.GetInputProductStructure();
    VizBuilder builder(*v.structure, v.input, nullptr);
    VizBuilderTestPeer::importVisuData(builder, v.input.GetReferenceFromId(kBracket));
    EXPECT_FALSE(v.structure->IsVizLoaded(kBracket));
    EXPECT_EQ(v.structure->GetErrorMessages(),
              (std::vector<std::u16string>{u"Could not Import VisuData from Bracket"}));
}

TEST(VisuDataImport, AnImportFailureIsStoredAndTheNextReferenceIsImported) {
    struct Case {
        TarvexFaultKind kind;
        std::u16string stored;
    };
    for (Case const& c :
         {Case{TarvexFaultKind::StdException, u"Error on VisuData Import (RefID 20) : visu broke"},
          Case{TarvexFaultKind::NonStdException,
               u"VisuData Import (RefID 20) Error : Unknown Exception"}}) {
        VisuImport v;
        v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard)};
        v.visu(kCover).nodes = {meshNode(u"c1", TarvexVisuGeometry_Standard)};
        v.model.Faults().Add(
            {"TarvexVisualizationImporter::Import", kBracket, c.kind, "visu broke"});
        DebugCapture debug;
        v.run(true, true);
        EXPECT_EQ(v.structure->GetVizContainer(kBracket), nullptr);
        EXPECT_FALSE(v.structure->IsVizLoaded(kBracket));
        EXPECT_NE(v.structure->GetVizContainer(kCover), nullptr);
        std::vector<std::u16string> const messages = v.structure->GetErrorMessages();
        ASSERT_EQ(messages.size(), 1u);
        EXPECT_NE(messages[0].find(c.stored), std::u16string::npos) << VizPort::Narrow(messages[0]);
        EXPECT_EQ(debug.texts().size(), 1u);
    }
}

// Run under the sanitizers: if the failed walk's ids stayed in the visual id map, Cover's
// PMI would read the freed mesh of Bracket while its links are resolved.
TEST(VisuDataImport, AWalkThatThrowsLeavesNoIdOfItsFreedElements) {
    VisuImport v;
    v.visu(kBracket).nodes = {meshNode(u"m1", TarvexVisuGeometry_Standard), pmiNode(u"n1")};
    v.visu(kCover).nodes = {pmiNode(u"c1", {u"m1/f", u"n1"})};
    // The walk of Bracket breaks at its second node, after the mesh was entered.
    v.model.Faults().Add({"TarvexVisuNodeIter::Current", kBracket, TarvexFaultKind::StdException,
                          "node broke", 1, 1});
    DebugCapture debug;
    v.run(true, true);
    EXPECT_EQ(v.structure->GetVizContainer(kBracket), nullptr);
    auto const& pmis = v.structure->GetVizPMIContainer(kCover)->GetVizPMIs();
    ASSERT_EQ(pmis.size(), 1u);
    EXPECT_EQ(pmis[0]->GetLinkedEntityMechIDs(), (std::vector<std::u16string>{u"", u""}));
}

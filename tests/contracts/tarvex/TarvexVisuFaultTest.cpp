#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexPolicy.h>
#include <VizBridge/contracts/tarvex/TarvexVisu2DTextBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/contracts/tarvex/TarvexVisuView.h>

#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

// Every operation of the visualisation data asks the model's plan, under its exact name, with
// the unique id of the imported reference as the subject (entities: 0), and throws either kind.

/// Value objects onto one of each kind, taken before any fault is planned.
struct Handles {
    TarvexVisuTestModel test;
    TarvexVisuImportResult result;
    TarvexVisuData data;
    TarvexVisuNodeIter nodes;
    TarvexVisuNode meshNode, pmiNode;
    TarvexVisuAttributes attributes;
    TarvexVisuFont font;
    TarvexVisuMesh mesh;
    TarvexVisuFaceIter faces;
    TarvexVisuFace face;
    TarvexVisuPolygonIter polygons;
    TarvexVisuPolygon polygon;
    TarvexVisuEdgeIter edges;
    TarvexVisuEdge edge;
    TarvexVisuWire wire;
    TarvexVisuPointSet pointSet;
    TarvexVisuPointsIter pointsIter;
    TarvexVisuPoints points;
    TarvexVisuPMI pmi;
    TarvexVisuTextIter texts;
    TarvexVisuText text;
    TarvexEntityIter linked;
    TarvexEntity entity;
    TarvexVisuEntity visuEntity;
    TarvexVisuViewIter views;
    TarvexVisuView view;
    TarvexVisuIDIter ids;
    TarvexVisuCaptureIter captures;
    TarvexVisuCapture capture;
    TarvexVisuCamera camera;
    TarvexVisuBuild2DTextResult built;

    Handles() {
        TarvexAuthoredVisuNode& meshRecord = test.Visu().nodes.emplace_back();
        meshRecord.type = TarvexVisuNode::VisuMesh;
        meshRecord.attributes.font = TarvexAuthoredVisuFont{};
        meshRecord.mesh.faces.push_back({u"f", {}, {0, 0, 0}, {0, 0, 1}, {{}}, {}, {}});
        meshRecord.mesh.edges.emplace_back();
        TarvexAuthoredVisuNode& pmiRecord = test.Visu().nodes.emplace_back();
        pmiRecord.type = TarvexVisuNode::VisuNote;
        pmiRecord.pointSet.points.emplace_back();
        pmiRecord.pmi.texts.push_back({u"T", {}, {1, 0, 0}, {0, 0, 1}, {}, {}, {}});
        pmiRecord.pmi.linkedElements.push_back({{}, 1, u"f", true});
        test.Visu().views.push_back({{}, {}, {}, {}, {}, {u"a"}});
        test.Visu().captures.emplace_back();

        result = TarvexVisualizationImporter().Import(test.Document());
        data = result.GetVisualizationData();
        nodes = data.GetNodeIterator();
        meshNode = Items(data.GetNodeIterator()).at(0);
        pmiNode = Items(data.GetNodeIterator()).at(1);
        attributes = meshNode.GetAttributes();
        attributes.GetFont(font);
        mesh = meshNode.GetMesh();
        faces = mesh.GetFaceIterator();
        face = Items(mesh.GetFaceIterator()).at(0);
        polygons = face.GetPolygonIterator();
        polygon = Items(face.GetPolygonIterator()).at(0);
        edges = mesh.GetEdgeIterator();
        edge = Items(mesh.GetEdgeIterator()).at(0);
        wire = meshNode.GetWire();
        pointSet = pmiNode.GetPointSet();
        pointsIter = pointSet.GetPointsIterator();
        points = Items(pointSet.GetPointsIterator()).at(0);
        pmi = pmiNode.GetPMI();
        texts = pmi.GetTextIterator();
        text = Items(pmi.GetTextIterator()).at(0);
        linked = pmi.GetLinkedElementIterator();
        entity = Items(pmi.GetLinkedElementIterator()).at(0);
        entity.GetPartEntity(visuEntity);
        views = data.GetViewIterator();
        view = Items(data.GetViewIterator()).at(0);
        ids = view.GetAnnotationIDIterator();
        captures = data.GetCaptureIterator();
        capture = Items(data.GetCaptureIterator()).at(0);
        camera = capture.GetCamera();
        built = TarvexVisu2DTextBuilder().Build2DText(text, TarvexVisuFont());
    }
};

struct OperationCase {
    std::string operation;
    std::function<void(Handles&)> call;
    unsigned int subject = 20;
};

void PrintTo(OperationCase const& c, std::ostream* os) {
    *os << c.operation;
}

TarvexFault FaultOn(OperationCase const& c, TarvexFaultKind kind, unsigned int subject) {
    TarvexFault fault;
    fault.operation = c.operation;
    fault.subject = subject;
    fault.kind = kind;
    fault.what = c.operation;
    return fault;
}

class TarvexVisuOperationFaultTest : public ::testing::TestWithParam<OperationCase> {};

TEST_P(TarvexVisuOperationFaultTest, ThrowsEitherKindWhenPlanned) {
    Handles handles;
    handles.test.model.Faults().Add(
        FaultOn(GetParam(), TarvexFaultKind::StdException, GetParam().subject));
    try {
        GetParam().call(handles);
        ADD_FAILURE() << "no fault thrown";
    } catch (std::runtime_error const& error) {
        EXPECT_EQ(error.what(), GetParam().operation);
    }

    handles.test.model.Faults().Clear();
    handles.test.model.Faults().Add(
        FaultOn(GetParam(), TarvexFaultKind::NonStdException, GetParam().subject));
    EXPECT_THROW(GetParam().call(handles), TarvexForeignError);
    EXPECT_EQ(handles.test.model.Faults().GetFiredCount(), 1);
}

TEST_P(TarvexVisuOperationFaultTest, PassesForAnotherSubject) {
    Handles handles;
    handles.test.model.Faults().Add(
        FaultOn(GetParam(), TarvexFaultKind::StdException, GetParam().subject + 1));
    EXPECT_NO_THROW(GetParam().call(handles));
}

using H = Handles&;

/// Calls a getter with one out-argument.
template <class Value, class Object, class Result>
void Out(Object const& object, Result (Object::*getter)(Value&) const) {
    Value value{};
    (object.*getter)(value);
}

template <class Object> void Rgb(Object const& object) {
    unsigned short r = 0, g = 0, b = 0;
    object.GetRGBColor(r, g, b);
}

template <class Object>
void Triples(Object const& object, bool (Object::*getter)(float*, float*, float*) const) {
    float a[3], b[3], c[3];
    (object.*getter)(a, b, c);
}

template <class Iterator>
void AddIterator(std::vector<OperationCase>& cases, std::string const& name,
                 Iterator Handles::*iterator) {
    cases.push_back({name + "::GetCount", [iterator](H h) { (h.*iterator).GetCount(); }});
    cases.push_back({name + "::Next", [iterator](H h) { (h.*iterator).Next(); }});
    cases.push_back({name + "::Current", [iterator](H h) { (h.*iterator).Current(); }});
}

std::vector<OperationCase> AllCases() {
    std::vector<OperationCase> cases{
        {"TarvexVisualizationImporter::Import",
         [](H h) { TarvexVisualizationImporter().Import(h.test.Document()); }},
        {"TarvexVisualizationImporter::ImportWithPolicy",
         [](H h) {
             TarvexVisualizationImporter().ImportWithPolicy(TarvexPolicy(), h.test.Document());
         }},
        {"TarvexVisuImportResult::GetVisualizationData",
         [](H h) { h.result.GetVisualizationData(); }},
        {"TarvexVisuData::GetNodeIterator", [](H h) { h.data.GetNodeIterator(); }},
        {"TarvexVisuData::GetUnits", [](H h) { h.data.GetUnits(); }},
        {"TarvexVisuData::GetViewIterator", [](H h) { h.data.GetViewIterator(); }},
        {"TarvexVisuData::GetCaptureIterator", [](H h) { h.data.GetCaptureIterator(); }},
        {"TarvexVisuNode::GetType", [](H h) { h.meshNode.GetType(); }},
        {"TarvexVisuNode::IsLeaf", [](H h) { h.meshNode.IsLeaf(); }},
        {"TarvexVisuNode::GetAttributes", [](H h) { h.meshNode.GetAttributes(); }},
        {"TarvexVisuNode::GetMesh", [](H h) { h.meshNode.GetMesh(); }},
        {"TarvexVisuNode::GetWire", [](H h) { h.meshNode.GetWire(); }},
        {"TarvexVisuNode::GetPointSet", [](H h) { h.meshNode.GetPointSet(); }},
        {"TarvexVisuNode::GetPMI", [](H h) { h.meshNode.GetPMI(); }},
        {"TarvexVisuAttributes::GetHidden",
         [](H h) { Out(h.attributes, &TarvexVisuAttributes::GetHidden); }},
        {"TarvexVisuAttributes::GetRGBColor", [](H h) { Rgb(h.attributes); }},
        {"TarvexVisuAttributes::GetAlphaColor",
         [](H h) { Out(h.attributes, &TarvexVisuAttributes::GetAlphaColor); }},
        {"TarvexVisuAttributes::GetFont",
         [](H h) { Out(h.attributes, &TarvexVisuAttributes::GetFont); }},
        {"TarvexVisuFont::GetFontName", [](H h) { h.font.GetFontName(); }},
        {"TarvexVisuFont::GetTextHeight", [](H h) { Out(h.font, &TarvexVisuFont::GetTextHeight); }},
        {"TarvexVisuFont::GetSpacingFactor",
         [](H h) { Out(h.font, &TarvexVisuFont::GetSpacingFactor); }},
        {"TarvexVisuFont::GetWidthScalingFactor",
         [](H h) { Out(h.font, &TarvexVisuFont::GetWidthScalingFactor); }},
        {"TarvexVisuMesh::GetID", [](H h) { Out(h.mesh, &TarvexVisuMesh::GetID); }},
        {"TarvexVisuMesh::GetMechanicalID",
         [](H h) { Out(h.mesh, &TarvexVisuMesh::GetMechanicalID); }},
        {"TarvexVisuMesh::GetGeometryType", [](H h) { h.mesh.GetGeometryType(); }},
        {"TarvexVisuMesh::GetFaceIterator", [](H h) { h.mesh.GetFaceIterator(); }},
        {"TarvexVisuMesh::GetEdgeIterator", [](H h) { h.mesh.GetEdgeIterator(); }},
        {"TarvexVisuFace::GetID", [](H h) { Out(h.face, &TarvexVisuFace::GetID); }},
        {"TarvexVisuFace::GetMechanicalID",
         [](H h) { Out(h.face, &TarvexVisuFace::GetMechanicalID); }},
        {"TarvexVisuFace::GetRGBColor", [](H h) { Rgb(h.face); }},
        {"TarvexVisuFace::GetAlphaColor", [](H h) { Out(h.face, &TarvexVisuFace::GetAlphaColor); }},
        {"TarvexVisuFace::GetVertices", [](H h) { Out(h.face, &TarvexVisuFace::GetVertices); }},
        {"TarvexVisuFace::GetNormals", [](H h) { Out(h.face, &TarvexVisuFace::GetNormals); }},
        {"TarvexVisuFace::GetPolygonIterator", [](H h) { h.face.GetPolygonIterator(); }},
        {"TarvexVisuPolygon::GetPolygonIndices",
         [](H h) {
             int const* indices = nullptr;
             TarvexVisuPolygonType type;
             h.polygon.GetPolygonIndices(indices, type);
         }},
        {"TarvexVisuEdge::GetMechanicalID",
         [](H h) { Out(h.edge, &TarvexVisuEdge::GetMechanicalID); }},
        {"TarvexVisuEdge::GetPoints", [](H h) { Out(h.edge, &TarvexVisuEdge::GetPoints); }},
        {"TarvexVisuEdge::GetLineIndices",
         [](H h) {
             int const* indices = nullptr;
             TarvexVisuLineType type;
             h.edge.GetLineIndices(indices, type);
         }},
        {"TarvexVisuEdge::GetRGBColor", [](H h) { Rgb(h.edge); }},
        {"TarvexVisuEdge::GetAlphaColor", [](H h) { Out(h.edge, &TarvexVisuEdge::GetAlphaColor); }},
        {"TarvexVisuWire::GetID", [](H h) { Out(h.wire, &TarvexVisuWire::GetID); }},
        {"TarvexVisuWire::GetGeometryType", [](H h) { h.wire.GetGeometryType(); }},
        {"TarvexVisuWire::GetEdgeIterator", [](H h) { h.wire.GetEdgeIterator(); }},
        {"TarvexVisuPointSet::GetGeometryType", [](H h) { h.pointSet.GetGeometryType(); }},
        {"TarvexVisuPointSet::GetPointsIterator", [](H h) { h.pointSet.GetPointsIterator(); }},
        {"TarvexVisuPoints::GetPoints", [](H h) { Out(h.points, &TarvexVisuPoints::GetPoints); }},
        {"TarvexVisuPoints::GetPointIndices",
         [](H h) { Out(h.points, &TarvexVisuPoints::GetPointIndices); }},
        {"TarvexVisuPoints::GetRGBColor", [](H h) { Rgb(h.points); }},
        {"TarvexVisuPoints::GetAlphaColor",
         [](H h) { Out(h.points, &TarvexVisuPoints::GetAlphaColor); }},
        {"TarvexVisuPMI::GetEdgeIterator", [](H h) { h.pmi.GetEdgeIterator(); }},
        {"TarvexVisuPMI::GetTextIterator", [](H h) { h.pmi.GetTextIterator(); }},
        {"TarvexVisuPMI::GetDisplayName", [](H h) { h.pmi.GetDisplayName(); }},
        {"TarvexVisuPMI::GetID", [](H h) { Out(h.pmi, &TarvexVisuPMI::GetID); }},
        {"TarvexVisuPMI::GetMechanicalID",
         [](H h) { Out(h.pmi, &TarvexVisuPMI::GetMechanicalID); }},
        {"TarvexVisuPMI::GetLinkedElementIterator", [](H h) { h.pmi.GetLinkedElementIterator(); }},
        {"TarvexVisuText::GetFont", [](H h) { Out(h.text, &TarvexVisuText::GetFont); }},
        {"TarvexVisuText::GetTextString",
         [](H h) {
             float a[3], d[3], n[3];
             h.text.GetTextString(a, d, n);
         }},
        {"TarvexVisuText::GetRGBColor", [](H h) { Rgb(h.text); }},
        {"TarvexVisuText::GetAlphaColor", [](H h) { Out(h.text, &TarvexVisuText::GetAlphaColor); }},
        {"TarvexEntity::GetPartEntity",
         [](H h) { Out<TarvexVisuEntity>(h.entity, &TarvexEntity::GetPartEntity); }, 0},
        {"TarvexVisuEntity::GetID", [](H h) { Out(h.visuEntity, &TarvexVisuEntity::GetID); }, 0},
        {"TarvexVisuView::GetHidden", [](H h) { Out(h.view, &TarvexVisuView::GetHidden); }},
        {"TarvexVisuView::GetDisplayName", [](H h) { h.view.GetDisplayName(); }},
        {"TarvexVisuView::GetID", [](H h) { Out(h.view, &TarvexVisuView::GetID); }},
        {"TarvexVisuView::GetMechanicalID",
         [](H h) { Out(h.view, &TarvexVisuView::GetMechanicalID); }},
        {"TarvexVisuView::GetViewAxis", [](H h) { Triples(h.view, &TarvexVisuView::GetViewAxis); }},
        {"TarvexVisuView::GetAnnotationIDIterator", [](H h) { h.view.GetAnnotationIDIterator(); }},
        {"TarvexVisuCapture::GetHidden",
         [](H h) { Out(h.capture, &TarvexVisuCapture::GetHidden); }},
        {"TarvexVisuCapture::GetActive",
         [](H h) { Out(h.capture, &TarvexVisuCapture::GetActive); }},
        {"TarvexVisuCapture::GetCamera", [](H h) { h.capture.GetCamera(); }},
        {"TarvexVisuCapture::GetDisplayName", [](H h) { h.capture.GetDisplayName(); }},
        {"TarvexVisuCapture::GetID", [](H h) { Out(h.capture, &TarvexVisuCapture::GetID); }},
        {"TarvexVisuCapture::GetMechanicalID",
         [](H h) { Out(h.capture, &TarvexVisuCapture::GetMechanicalID); }},
        {"TarvexVisuCapture::GetHiddenText", [](H h) { h.capture.GetHiddenText(); }},
        {"TarvexVisuCapture::GetClippingPlane",
         [](H h) { Triples(h.capture, &TarvexVisuCapture::GetClippingPlane); }},
        {"TarvexVisuCapture::GetAnnotationIDIterator",
         [](H h) { h.capture.GetAnnotationIDIterator(); }},
        {"TarvexVisuCapture::GetFTACGIDIterator", [](H h) { h.capture.GetFTACGIDIterator(); }},
        {"TarvexVisuCapture::GetManagesGeometry", [](H h) { h.capture.GetManagesGeometry(); }},
        {"TarvexVisuCapture::GetBodyIDIterator", [](H h) { h.capture.GetBodyIDIterator(); }},
        {"TarvexVisuCamera::GetType", [](H h) { h.camera.GetType(); }},
        {"TarvexVisuCamera::GetOrientation",
         [](H h) { Triples(h.camera, &TarvexVisuCamera::GetOrientation); }},
        {"TarvexVisuCamera::GetPerspectiveViewAngle",
         [](H h) { h.camera.GetPerspectiveViewAngle(); }},
        {"TarvexVisuCamera::GetOrthographicZoomFactor",
         [](H h) { h.camera.GetOrthographicZoomFactor(); }},
        {"TarvexVisu2DTextBuilder::Build2DText",
         [](H h) { TarvexVisu2DTextBuilder().Build2DText(h.text, h.font); }},
        {"TarvexVisuBuild2DTextResult::GetStrokedFontTextIterator",
         [](H h) { h.built.GetStrokedFontTextIterator(); }},
        {"TarvexVisuBuild2DTextResult::GetFilledFontTextIterator",
         [](H h) { h.built.GetFilledFontTextIterator(); }},
    };
    AddIterator(cases, "TarvexVisuNodeIter", &Handles::nodes);
    AddIterator(cases, "TarvexVisuFaceIter", &Handles::faces);
    AddIterator(cases, "TarvexVisuPolygonIter", &Handles::polygons);
    AddIterator(cases, "TarvexVisuEdgeIter", &Handles::edges);
    AddIterator(cases, "TarvexVisuPointsIter", &Handles::pointsIter);
    AddIterator(cases, "TarvexVisuTextIter", &Handles::texts);
    AddIterator(cases, "TarvexEntityIter", &Handles::linked);
    AddIterator(cases, "TarvexVisuViewIter", &Handles::views);
    AddIterator(cases, "TarvexVisuIDIter", &Handles::ids);
    AddIterator(cases, "TarvexVisuCaptureIter", &Handles::captures);
    return cases;
}

INSTANTIATE_TEST_SUITE_P(AllOperations, TarvexVisuOperationFaultTest,
                         ::testing::ValuesIn(AllCases()),
                         [](::testing::TestParamInfo<OperationCase> const& info) {
                             std::string name = info.param.operation;
                             name.replace(name.find("::"), 2, "_");
                             return name;
                         });

TEST(TarvexVisuFaultTest, AFaultedImportLeavesTheNextImportWhole) {
    TarvexVisuTestModel test;
    test.Visu().nodes.resize(3);
    TarvexFault fault;
    fault.operation = "TarvexVisualizationImporter::Import";
    fault.times = 1;
    test.model.Faults().Add(fault);
    EXPECT_THROW(test.Import(), std::runtime_error);
    EXPECT_EQ(test.Import().GetNodeIterator().GetCount(), 3);
    // Both calls count, the one that threw too.
    EXPECT_EQ(test.model.GetImportCalls().size(), 2u);
}

} // namespace

#include "TarvexTestText.h"
#include "support/TarvexVisuTestModel.h"

#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointsIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <ostream>

namespace {

// Every optional getter of the visualisation data answers false and leaves its arguments
// alone when the value is absent, and answers true and overwrites them when it is present.
// The data below has every value present, each different from the sentinels the getters are
// called with.

TarvexAuthoredVisuFont FullFont() {
    return {u"Arial", 2.5f, 1.5f, 0.5f};
}

TarvexAuthoredVisuData FullData() {
    TarvexAuthoredVisuData data;
    TarvexVisuTriples const triples{{{1, 2, 3}, {4, 5, 6}, {7, 8, 9}}};

    TarvexAuthoredVisuNode& mesh = data.nodes.emplace_back();
    mesh.type = TarvexVisuNode::VisuMesh;
    mesh.attributes = {false, {{1, 2, 3}}, 4, FullFont()};
    mesh.mesh.id = u"mesh";
    mesh.mesh.mechanicalId = u"mesh-m";
    mesh.mesh.faces.push_back({u"face", u"face-m", {0, 0, 0}, {0, 0, 1}, {}, {{1, 2, 3}}, 4});
    mesh.mesh.edges.push_back(
        {u"edge-m", {0, 0, 0}, {{0}}, TarvexVisuLine_Polyline, {{1, 2, 3}}, 4});

    TarvexAuthoredVisuNode& wire = data.nodes.emplace_back();
    wire.type = TarvexVisuNode::VisuWire;
    wire.wire.id = u"wire";

    TarvexAuthoredVisuNode& points = data.nodes.emplace_back();
    points.type = TarvexVisuNode::VisuPointSet;
    points.pointSet.points.push_back({{0, 0, 0}, {{0}}, {{1, 2, 3}}, 4});

    TarvexAuthoredVisuNode& pmi = data.nodes.emplace_back();
    pmi.type = TarvexVisuNode::VisuNote;
    pmi.pmi.id = u"pmi";
    pmi.pmi.mechanicalId = u"pmi-m";
    pmi.pmi.texts.push_back({u"text", {}, {1, 0, 0}, {0, 0, 1}, FullFont(), {{1, 2, 3}}, 4});
    pmi.pmi.linkedElements.push_back({{}, 0, u"face", true});

    data.views.push_back({false, u"view", u"view-id", u"view-m", triples, {}});

    TarvexAuthoredVisuCapture& capture = data.captures.emplace_back();
    capture.hidden = false;
    capture.active = false;
    capture.id = u"capture";
    capture.mechanicalId = u"capture-m";
    capture.clippingPlane = triples;
    capture.camera.orientation = triples;
    return data;
}

struct Outcome {
    bool answer;
    bool untouched;
};

Outcome ReadText(bool answer, TarvexWString const& value) {
    return {answer, TextOf(value) == u"sentinel"};
}

template <class Object> Outcome ReadRgb(Object const& object) {
    unsigned short red = 7, green = 8, blue = 9;
    bool const answer = object.GetRGBColor(red, green, blue);
    return {answer, red == 7 && green == 8 && blue == 9};
}

template <class Object> Outcome ReadAlpha(Object const& object) {
    unsigned short alpha = 77;
    bool const answer = object.GetAlphaColor(alpha);
    return {answer, alpha == 77};
}

template <class Object> Outcome ReadHidden(Object const& object) {
    bool hidden = true;
    bool const answer = object.GetHidden(hidden);
    return {answer, hidden};
}

template <class Object> Outcome ReadId(Object const& object) {
    TarvexWString id(u"sentinel");
    bool const answer = object.GetID(id);
    return ReadText(answer, id);
}

template <class Object> Outcome ReadMechanicalId(Object const& object) {
    TarvexWString id(u"sentinel");
    bool const answer = object.GetMechanicalID(id);
    return ReadText(answer, id);
}

template <class Read> Outcome ReadTriples(Read read) {
    float a[3] = {77, 77, 77}, b[3] = {77, 77, 77}, c[3] = {77, 77, 77};
    bool const answer = read(a, b, c);
    bool const untouched = std::all_of(a, a + 3, [](float v) { return v == 77; }) &&
                           std::all_of(b, b + 3, [](float v) { return v == 77; }) &&
                           std::all_of(c, c + 3, [](float v) { return v == 77; });
    return {answer, untouched};
}

template <class Getter> Outcome ReadNumber(TarvexVisuFont const& font, Getter getter) {
    float value = 77;
    bool const answer = (font.*getter)(value);
    return {answer, value == 77};
}

// Reaching the objects of FullData after an import.
TarvexVisuNode Node(TarvexVisuData const& data, std::size_t index) {
    return Items(data.GetNodeIterator()).at(index);
}
TarvexVisuFont AttributesFont(TarvexVisuData const& data) {
    TarvexVisuFont font;
    Node(data, 0).GetAttributes().GetFont(font);
    return font;
}
TarvexVisuFace Face(TarvexVisuData const& data) {
    return Items(Node(data, 0).GetMesh().GetFaceIterator()).at(0);
}
TarvexVisuEdge Edge(TarvexVisuData const& data) {
    return Items(Node(data, 0).GetMesh().GetEdgeIterator()).at(0);
}
TarvexVisuPoints Points(TarvexVisuData const& data) {
    return Items(Node(data, 2).GetPointSet().GetPointsIterator()).at(0);
}
TarvexVisuPMI Pmi(TarvexVisuData const& data) {
    return Node(data, 3).GetPMI();
}
TarvexVisuText Text(TarvexVisuData const& data) {
    return Items(Pmi(data).GetTextIterator()).at(0);
}
TarvexVisuFont TextFont(TarvexVisuData const& data) {
    TarvexVisuFont font;
    Text(data).GetFont(font);
    return font;
}
TarvexVisuView View(TarvexVisuData const& data) {
    return Items(data.GetViewIterator()).at(0);
}
TarvexVisuCapture Capture(TarvexVisuData const& data) {
    return Items(data.GetCaptureIterator()).at(0);
}

struct GetterCase {
    char const* name;
    void (*makeAbsent)(TarvexAuthoredVisuData&);
    Outcome (*read)(TarvexVisuData const&);
};

void PrintTo(GetterCase const& c, std::ostream* os) {
    *os << c.name;
}

using D = TarvexVisuData const&;
using A = TarvexAuthoredVisuData&;

GetterCase const kCases[] = {
    {"AttributesHidden", [](A d) { d.nodes[0].attributes.hidden.reset(); },
     [](D d) { return ReadHidden(Node(d, 0).GetAttributes()); }},
    {"AttributesRGB", [](A d) { d.nodes[0].attributes.rgb.reset(); },
     [](D d) { return ReadRgb(Node(d, 0).GetAttributes()); }},
    {"AttributesAlpha", [](A d) { d.nodes[0].attributes.alpha.reset(); },
     [](D d) { return ReadAlpha(Node(d, 0).GetAttributes()); }},
    {"AttributesFont", [](A d) { d.nodes[0].attributes.font.reset(); },
     [](D d) {
         // A font of its own reads back with a name; the sentinel font has none.
         TarvexVisuFont font;
         bool const answer = Node(d, 0).GetAttributes().GetFont(font);
         return Outcome{answer, !font.GetFontName().HasText()};
     }},
    {"FontTextHeight", [](A d) { d.nodes[0].attributes.font->textHeight.reset(); },
     [](D d) { return ReadNumber(AttributesFont(d), &TarvexVisuFont::GetTextHeight); }},
    {"FontSpacingFactor", [](A d) { d.nodes[0].attributes.font->spacingFactor.reset(); },
     [](D d) { return ReadNumber(AttributesFont(d), &TarvexVisuFont::GetSpacingFactor); }},
    {"FontWidthScaling", [](A d) { d.nodes[0].attributes.font->widthScalingFactor.reset(); },
     [](D d) { return ReadNumber(AttributesFont(d), &TarvexVisuFont::GetWidthScalingFactor); }},
    {"MeshID", [](A d) { d.nodes[0].mesh.id.reset(); },
     [](D d) { return ReadId(Node(d, 0).GetMesh()); }},
    {"MeshMechanicalID", [](A d) { d.nodes[0].mesh.mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(Node(d, 0).GetMesh()); }},
    {"FaceID", [](A d) { d.nodes[0].mesh.faces[0].id.reset(); },
     [](D d) { return ReadId(Face(d)); }},
    {"FaceMechanicalID", [](A d) { d.nodes[0].mesh.faces[0].mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(Face(d)); }},
    {"FaceRGB", [](A d) { d.nodes[0].mesh.faces[0].rgb.reset(); },
     [](D d) { return ReadRgb(Face(d)); }},
    {"FaceAlpha", [](A d) { d.nodes[0].mesh.faces[0].alpha.reset(); },
     [](D d) { return ReadAlpha(Face(d)); }},
    {"EdgeMechanicalID", [](A d) { d.nodes[0].mesh.edges[0].mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(Edge(d)); }},
    {"EdgeRGB", [](A d) { d.nodes[0].mesh.edges[0].rgb.reset(); },
     [](D d) { return ReadRgb(Edge(d)); }},
    {"EdgeAlpha", [](A d) { d.nodes[0].mesh.edges[0].alpha.reset(); },
     [](D d) { return ReadAlpha(Edge(d)); }},
    {"WireID", [](A d) { d.nodes[1].wire.id.reset(); },
     [](D d) { return ReadId(Node(d, 1).GetWire()); }},
    {"PointsRGB", [](A d) { d.nodes[2].pointSet.points[0].rgb.reset(); },
     [](D d) { return ReadRgb(Points(d)); }},
    {"PointsAlpha", [](A d) { d.nodes[2].pointSet.points[0].alpha.reset(); },
     [](D d) { return ReadAlpha(Points(d)); }},
    {"PMIID", [](A d) { d.nodes[3].pmi.id.reset(); }, [](D d) { return ReadId(Pmi(d)); }},
    {"PMIMechanicalID", [](A d) { d.nodes[3].pmi.mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(Pmi(d)); }},
    {"TextRGB", [](A d) { d.nodes[3].pmi.texts[0].rgb.reset(); },
     [](D d) { return ReadRgb(Text(d)); }},
    {"TextAlpha", [](A d) { d.nodes[3].pmi.texts[0].alpha.reset(); },
     [](D d) { return ReadAlpha(Text(d)); }},
    {"TextFont", [](A d) { d.nodes[3].pmi.texts[0].font.reset(); },
     [](D d) {
         TarvexVisuFont font;
         bool const answer = Text(d).GetFont(font);
         return Outcome{answer, !font.GetFontName().HasText()};
     }},
    {"TextFontHeight", [](A d) { d.nodes[3].pmi.texts[0].font->textHeight.reset(); },
     [](D d) { return ReadNumber(TextFont(d), &TarvexVisuFont::GetTextHeight); }},
    {"LinkedVisualID", [](A d) { d.nodes[3].pmi.linkedElements[0].visualId.reset(); },
     [](D d) {
         TarvexVisuEntity entity;
         Items(Pmi(d).GetLinkedElementIterator()).at(0).GetPartEntity(entity);
         return ReadId(entity);
     }},
    {"ViewHidden", [](A d) { d.views[0].hidden.reset(); }, [](D d) { return ReadHidden(View(d)); }},
    {"ViewID", [](A d) { d.views[0].id.reset(); }, [](D d) { return ReadId(View(d)); }},
    {"ViewMechanicalID", [](A d) { d.views[0].mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(View(d)); }},
    {"ViewAxis", [](A d) { d.views[0].axis.reset(); },
     [](D d) {
         return ReadTriples(
             [&](float* a, float* b, float* c) { return View(d).GetViewAxis(a, b, c); });
     }},
    {"CaptureHidden", [](A d) { d.captures[0].hidden.reset(); },
     [](D d) { return ReadHidden(Capture(d)); }},
    {"CaptureActive", [](A d) { d.captures[0].active.reset(); },
     [](D d) {
         bool active = true;
         bool const answer = Capture(d).GetActive(active);
         return Outcome{answer, active};
     }},
    {"CaptureID", [](A d) { d.captures[0].id.reset(); }, [](D d) { return ReadId(Capture(d)); }},
    {"CaptureMechanicalID", [](A d) { d.captures[0].mechanicalId.reset(); },
     [](D d) { return ReadMechanicalId(Capture(d)); }},
    {"CaptureClippingPlane", [](A d) { d.captures[0].clippingPlane.reset(); },
     [](D d) {
         return ReadTriples(
             [&](float* a, float* b, float* c) { return Capture(d).GetClippingPlane(a, b, c); });
     }},
    {"CameraOrientation", [](A d) { d.captures[0].camera.orientation.reset(); },
     [](D d) {
         return ReadTriples([&](float* a, float* b, float* c) {
             return Capture(d).GetCamera().GetOrientation(a, b, c);
         });
     }},
};

class TarvexVisuGetterTest : public ::testing::TestWithParam<GetterCase> {};

TEST_P(TarvexVisuGetterTest, PresentOverwritesTheArguments) {
    TarvexVisuTestModel test;
    test.Visu() = FullData();
    Outcome const outcome = GetParam().read(test.Import());
    EXPECT_TRUE(outcome.answer);
    EXPECT_FALSE(outcome.untouched);
}

TEST_P(TarvexVisuGetterTest, AbsentLeavesTheArgumentsAlone) {
    TarvexVisuTestModel test;
    test.Visu() = FullData();
    GetParam().makeAbsent(test.Visu());
    Outcome const outcome = GetParam().read(test.Import());
    EXPECT_FALSE(outcome.answer);
    EXPECT_TRUE(outcome.untouched);
}

INSTANTIATE_TEST_SUITE_P(AllValues, TarvexVisuGetterTest, ::testing::ValuesIn(kCases),
                         [](::testing::TestParamInfo<GetterCase> const& info) {
                             return info.param.name;
                         });

TEST(TarvexVisuGetterTest, DefaultObjectsHaveNoValues) {
    EXPECT_FALSE(ReadHidden(TarvexVisuAttributes()).answer);
    EXPECT_FALSE(ReadRgb(TarvexVisuAttributes()).answer);
    EXPECT_FALSE(ReadAlpha(TarvexVisuFace()).answer);
    EXPECT_FALSE(ReadId(TarvexVisuMesh()).answer);
    EXPECT_FALSE(ReadMechanicalId(TarvexVisuEdge()).answer);
    EXPECT_FALSE(ReadId(TarvexVisuEntity()).answer);
    EXPECT_FALSE(ReadNumber(TarvexVisuFont(), &TarvexVisuFont::GetTextHeight).answer);
    EXPECT_FALSE(TarvexVisuFont().GetFontName().HasText());
    EXPECT_FALSE(ReadTriples([](float* a, float* b, float* c) {
                     return TarvexVisuCamera().GetOrientation(a, b, c);
                 }).answer);
    TarvexVisuFont font;
    EXPECT_FALSE(TarvexVisuText().GetFont(font));
}

} // namespace

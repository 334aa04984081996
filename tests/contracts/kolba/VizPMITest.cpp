#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/ContainerContext.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizContainer.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizView.h>

#include <gtest/gtest.h>

#include <memory>
#include <tuple>
#include <vector>

using namespace KolbaVizCore;
using VizPort::WString;

namespace {

RenderId pathOf(std::vector<std::uint32_t> const& tags) {
    RenderId id(1);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

/// Gives `element` its id and, as a renderer would, the path it was drawn at.
template <class Element> Element* drawn(Element* element, int id, RenderId const& path) {
    element->setID(static_cast<unsigned long>(id));
    element->Set3DRenderID(path);
    return element;
}

/// 1/20/1 a line along x, with 1/20/1/5 a line at y = 5 below it; 1/20/2 a point at x = 10;
/// 1/20/3 a point at x = 20; 1/20/4 a point at x = 30.
void buildPMIScene(SceneBuilder& builder) {
    AGeometryItemFactory& make = *builder.GetGeometryItemFactory();
    SceneContext scene(&builder, 1, u"ROOT");
    ContainerContext pmi(&builder, 20, u"PMI", 2);
    {
        float const line[6] = {0, 0, 0, 1, 0, 0};
        float const below[6] = {0, 5, 0, 1, 5, 0};
        SceneLevelContext first(&builder, 1, u"PMI 1");
        builder.AddGeometryItem(make.MakePolyline(1, line, 6));
        SceneLevelContext edge(&builder, 5, u"edge");
        builder.AddGeometryItem(make.MakePolyline(5, below, 6));
    }
    for (std::uint32_t const tag : {2u, 3u, 4u}) {
        SceneLevelContext level(&builder, tag, u"level");
        builder.AddGeometryItem(make.MakePoint(tag, 10.0f * static_cast<float>(tag - 1), 0, 0));
    }
}

} // namespace

TEST(VizPMICollection, AnElementIsAMemberByItsMechanicalOrVisualIdAndStartsInactive) {
    VizPMIType const note(VizPMIType::FirstNote, "VisuNote", Note);
    VizPMI pmi(note, note);
    pmi.SetMechanicalID(u"M1");
    pmi.SetVisualID(u"V1");
    VizEdge edge; // no visual id: only its mechanical id names it
    edge.SetMechanicalID(u"E");
    // The member keys, the element, whether it is a member.
    std::tuple<std::vector<WString>, VizElement const*, bool> const cases[] = {
        {{u"M1"}, &pmi, true},   {{u"x", u"V1"}, &pmi, true}, {{u"M"}, &pmi, false},
        {{}, &pmi, false},       {{u""}, &edge, false},       {{u"E"}, &edge, true},
        {{u"M1"}, &edge, false},
    };
    for (auto const& [members, element, member] : cases) {
        VizView view;
        for (WString const& key : members)
            view.AddMember(key);
        EXPECT_EQ(view.IsMember(*element), member)
            << element->GetElementType() << " among " << members.size() << " keys";
    }
    VizCapture capture;
    EXPECT_FALSE(capture.GetActive());
    capture.SetActive(true);
    EXPECT_TRUE(capture.GetActive());
}

// Run under the sanitizer build as well: a replaced record that leaks, or a record handed
// back that is freed, fails there.
TEST(VizPMIContainer, FilesSemanticRecordsByIdAndPrintsPropertiesInKeyOrder) {
    VizPMIContainer container(1);
    container.AddSemanticPMI(
        std::make_unique<SemanticPMI>(SemanticPMI{u"old", u"", u"12", {}, {}}).release());
    SemanticPMI* const record =
        std::make_unique<SemanticPMI>(SemanticPMI{u"Datum A", u"A", u"12", {}, {}}).release();
    record->Properties = {{u"b", u"1"}, {u"B", u"2"}, {u"_0", u"3"}, {u"0_", u"4"}, {u"a", u"5"}};
    container.AddSemanticPMI(record); // frees the old record
    container.AddSemanticPMI(record); // and keeps one that is handed back
    WString text = u"untouched";
    EXPECT_FALSE(container.GetSemanticPMIAsString(u"Datum A", text)) << "filed by ID only";
    EXPECT_EQ(text, u"untouched");
    ASSERT_TRUE(container.GetSemanticPMIAsString(u"12", text));
    EXPECT_EQ(text, u"Name : Datum A\nLabel : A\nID : 12\n0_ : 4\nB : 2\n_0 : 3\na : 5\nb : 1\n");
}

// Render ids are set by hand: what counts is how the container reads them.
TEST(VizPMIContainer, PicksTheElementDrawnDeepestAboveThePickedNodeAndNothingWithoutAView) {
    SceneBuilder builder;
    buildPMIScene(builder);
    View3DAdapter view(nullptr, &builder);
    VizPMIType const note(VizPMIType::FirstNote, "VisuNote", Note);
    VizPMIContainer container(1);
    auto* const first = drawn(new VizPMI(note, note), 1, pathOf({1, 20, 1}));
    first->AddEdge(drawn(new VizEdge, 11, pathOf({1, 20, 1, 5})));
    auto* const second = drawn(new VizPMI(note, note), 2, pathOf({1, 20, 2}));
    second->AddEdge(drawn(new VizEdge, 21, pathOf({1, 20, 2}))); // drawn in its owner's node
    container.AddVizPMI(first); // the container takes each element over
    container.AddVizPMI(second);
    container.AddVizPMI(drawn(new VizPMI(note, note), 3, pathOf({1, 20, 1, 9}))); // shows nothing
    container.AddVizPMI(new VizPMI(note, note));                                  // never drawn
    auto* const wire = drawn(new VizWire, 40, pathOf({1, 20, 3}));
    container.AddVizFTACGWire(wire);
    container.AddView(drawn(new VizView, 50, pathOf({1, 20, 4})));
    VizContainer geometry(2);
    auto* const mesh = drawn(new VizMesh, 60, pathOf({1, 20}));
    mesh->AddFace(drawn(new VizFace, 61, pathOf({1, 20, 1, 5})));
    geometry.AddMesh(mesh);

    VizEdge outside;
    // The ray straight down through (x, y), the ids the two containers answer (0: none).
    struct Case {
        double x, y;
        int pmi, tessellated;
    } const cases[] = {
        {0.5, 0, 1, 60}, {0.5, 5, 11, 61}, {10, 0, 2, 60},
        {20, 0, 40, 60}, {30, 0, 50, 60},  {50, 50, 0, 0},
    };
    for (Case const& c : cases) {
        Ray const ray{{c.x, c.y, 10}, {0, 0, -1}};
        for (auto const& [picker, expected] :
             {std::pair<AVizContainer*, int>{&container, c.pmi}, {&geometry, c.tessellated}}) {
            VizElement* element = &outside;
            EXPECT_EQ(picker->PickVisual(&view, ray, element), expected != 0);
            EXPECT_EQ(element == &outside ? 0 : element->GetID(), expected)
                << picker->GetTypeName() << " at " << c.x << ',' << c.y;
        }
    }
    VizElement* element = &outside;
    EXPECT_FALSE(container.PickVisual(nullptr, Ray{{0.5, 0, 10}, {0, 0, -1}}, element));
    EXPECT_FALSE(geometry.PickVisual(nullptr, Ray{{0.5, 0, 10}, {0, 0, -1}}, element));
    EXPECT_EQ(element, &outside);
}

#include "LoaderTestSupport.h"

#include <VizBridge/loaders/PMITypeMapping.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <stdexcept>

namespace {

using namespace LoaderTest;
using NodeType = TarvexVisuNode::TarvexVisuNodeType;

// Every node type, from below the range to past it, by ranges: first and last node type, the PMI
// type of the first (the others count on from it, unless it is 0), the node type of their group
// and their entity type. Node type 10 is a PMI of its own, with no group; 11 has no PMI type; 1
// to 9 are no PMI and come back as 0.
std::tuple<int, int, int, int, EntityType> const kNodeRanges[] = {
    {-3, 9, 0, 0, UnknownPMI}, {10, 10, 1, 0, PMI},         {11, 11, 0, 0, UnknownPMI},
    {12, 15, 2, 12, Note},     {16, 19, 6, 16, Datum},      {20, 32, 10, 20, Dimension},
    {33, 55, 23, 33, GeomTol}, {56, 57, 46, 56, Roughness}, {58, 70, 0, 0, UnknownPMI},
};

TEST(PMITypeMappingTest, MapsEveryNodeTypeBothWays) {
    for (auto const& [first, last, firstPMI, group, entity] : kNodeRanges)
        for (int node = first; node <= last; ++node) {
            SCOPED_TRACE(node);
            int const pmi = firstPMI == 0 ? 0 : firstPMI + node - first;
            EXPECT_EQ(GetVizPMITypeFromVisuNodeType(NodeType(node)), pmi);
            EXPECT_EQ(GetVisuPMIGroupTypeFromVisuNodeType(NodeType(node)), group);
            EXPECT_EQ(GetVisuNodeTypeFromVizPMIType(VizPMIType::ID(pmi)), pmi == 0 ? 0 : node);
            EXPECT_EQ(GetEntityTypeFromVizPMIType(VizPMIType::ID(pmi)), entity);
        }
    for (VizPMIType::ID const pmi : {VizPMIType::ID(-1), VizPMIType::ID(48)})
        EXPECT_EQ(std::pair(GetVisuNodeTypeFromVizPMIType(pmi), GetEntityTypeFromVizPMIType(pmi)),
                  std::pair(TarvexVisuNode::VisuUnknown, UnknownPMI));
}

TarvexAuthoredVisuAttributes Fonted(Font font) {
    return Entry({}, {}, std::move(font));
}

// Own font, own colour, the stack (oldest first), what shows. A text takes its own font, else the
// newest font of the stack, with 1 for missing values; the newest font counts whole. It looks up
// colour and font in the stack even when told not to.
std::tuple<std::optional<Font>, std::optional<A>, Entries, char const*> const kTextRows[] = {
    {Font{{}, 2.5f, {}, {}}, {}, {}, "'x' (2.5 1 1)"},
    {Font{u"Arial", 3, 1.5f, 0.5f}, {}, {Fonted({u"Mono", 9, 9, 9})}, "'x' Arial(3 1.5 0.5)"},
    {{}, {}, {Fonted({u"Serif", 4, 2, 2}), Fonted({u"Mono", 5, {}, {}})}, "'x' Mono(5 1 1)"},
    {{}, {}, {Fonted({u"Mono", 5, {}, {}}), Entry({}, {})}, "'x' Mono(5 1 1)"},
    {{}, A{10, 20, 30}, {Entry({}, 40), Entry({}, 50)}, "rgba(10,20,30,50) 'x' (1 1 1)"},
};

TEST(VizTextLoaderTest, TakesFontAndColourFromItselfOrTheStack) {
    for (auto const& [font, rgb, entries, expected] : kTextRows) {
        TarvexAuthoredVisuText const record{u"x", {0, 0, 0}, {1, 0, 0}, {0, 0, 1}, font, rgb, {}};
        Stack stack = StackOf(entries);
        EXPECT_EQ(Loaded<VizTextLoader>(Make<TarvexVisuText>(record), &stack),
                  "VizText " + std::string(expected) + " at 0 0 0|1 0 0|0 0 1");
    }
}

// Strokes without indices load as nothing; a text is made if any piece is (a text that lays out
// to nothing at all is among the PMI cases).
TEST(TesselateTextTest, SucceedsWithAnyPieceAndHandsOverNothingOtherwise) {
    using Row = std::tuple<std::size_t, std::size_t, std::size_t, bool>;
    for (auto const& [strokes, without, faces, made] :
         {Row{2, 1, 0, true}, Row{0, 0, 3, true}, Row{0, 2, 0, false}}) {
        auto built = std::make_shared<std::vector<TarvexAuthoredVisuEdge>>(strokes, Line());
        built->resize(strokes + without, Line(std::nullopt));
        auto filled = std::make_shared<std::vector<TarvexAuthoredVisuFace>>(faces);
        std::vector<VizEdge*> edges;
        std::vector<VizFace*> shapes;
        bool const result = tesselateText(
            [&] { return TarvexVisuBuild2DTextResult(TarvexVisuContext(), built, filled); },
            nullptr, edges, shapes);
        EXPECT_EQ(result, made);
        EXPECT_EQ(adoptAll(edges).size(), made ? strokes : 0u);
        EXPECT_EQ(adoptAll(shapes).size(), made ? faces : 0u);
    }
}

std::unique_ptr<VizPMI> Load(TarvexVisuPMI const& source, Stack* stack, bool tesselate) {
    VizPMILoader loader(source, stack, TarvexVisuNode::VisuNote, TarvexVisuNode::VisuNote,
                        tesselate);
    return loadAs<VizPMI>(loader);
}

/// A PMI read back through an import of part 20, for what only a model gives: texts the text
/// builder lays out, entities that reach instances, faults that fire.
struct ImportedPMI {
    explicit ImportedPMI(TarvexAuthoredVisuPMI pmi) {
        test.Visu().nodes.push_back(
            {TarvexVisuNode::VisuNote, true, {}, {}, {}, {}, std::move(pmi)});
        source = test.Nodes().back().GetPMI();
    }
    /// Plans `operation` to throw once after `skip` calls, a std::exception or a foreign error.
    void FailOnce(std::string operation, int skip, bool foreign = false) {
        auto const kind =
            foreign ? TarvexFaultKind::NonStdException : TarvexFaultKind::StdException;
        test.model.Faults().Add({std::move(operation), std::nullopt, kind, "planned", skip, 1});
    }
    TarvexVisuTestModel test;
    TarvexVisuPMI source;
};

TarvexAuthoredVisuPMI PMIRecord(std::vector<TarvexAuthoredVisuEdge> edges,
                                std::vector<TarvexAuthoredVisuText> texts = {}) {
    return {{}, {}, {}, std::move(edges), std::move(texts), {}};
}

std::string const kNotice = "VizText rgba(255,255,0,255) 'Failed to Tesselate Text!' ";

// A PMI's group is that of the first node type it is given, its type the second's. Its edges and
// texts always inherit and are drawn opaque; those without content are left out. Linked are the
// part's own entities that have a visual id, in order. Any entry of the stack that hides hides
// the PMI.
TEST(VizPMILoaderTest, LoadsTypesEdgesTextsNamesLinkedPartEntitiesAndHiddenState) {
    TarvexAuthoredVisuPMI record{u"Note 1", u"v-1", u"m-1", {Line(), Line({}), Line()}, {}, {}};
    record.edges[2].rgb = A{9, 9, 9};
    record.edges[2].alpha = 10;
    record.texts = {TextRecord(u""), TextRecord(u"A 5"), TextRecord({})};
    record.linkedElements = {{{}, 1, u"f1", true}, {{1}, 2, u"in-instance", true},
                             {{}, 3, {}, true},    {{}, 4, u"no-part", false},
                             {{}, 5, u"e2", true}, {{}, 6, u"f3", true}};
    ImportedPMI const imported(record);
    std::string const content = " name=Note 1 m=m-1 links f1|e2|f3\n"
                                "  VizEdge rgba(1,2,3,255) Polyline[0 0 0 1 1 1]\n"
                                "  VizEdge rgba(9,9,9,255) Polyline[0 0 0 1 1 1]\n"
                                "  VizText rgba(1,2,3,255) 'A 5' (1 1 1) at 0 0 0|1 0 0|0 0 1";
    // The hidden state of an older and a newer entry, the node types, what shows first.
    using Row = std::tuple<std::optional<bool>, std::optional<bool>, int, int, char const*>;
    for (auto const& [older, newer, group, type, shown] :
         {Row{{}, false, 10, 10, "VizPMI id=v-1 VisuUnknown:0:10100 VisuPMI:1:10005"},
          Row{false, true, 57, 13,
              "VizPMI hidden id=v-1 VisuRoughnessGroup:46:10105 VisuNote:3:10101"},
          Row{true, false, 15, 12,
              "VizPMI hidden id=v-1 VisuNoteGroup:2:10101 VisuNoteGroup:2:10101"}}) {
        Stack stack = StackOf({{older, A{1, 2, 3}, {}, {}}, {newer, {}, 60, {}}});
        VizPMILoader loader(imported.source, &stack, NodeType(group), NodeType(type), false);
        EXPECT_EQ(Show(loadAs<VizPMI>(loader).get()), shown + content);
    }
}

// A PMI with nothing to show is null, and nothing more of it is read.
TEST(VizPMILoaderTest, APMIWithNothingToShowIsNull) {
    for (auto const& [record, loaded] :
         {std::pair{PMIRecord({}), false},
          {PMIRecord({}, {TextRecord(u""), TextRecord({})}), false},
          {PMIRecord({Line({})}), false},
          {PMIRecord({Line()}), true},
          {PMIRecord({}, {TextRecord(u"  ")}), true}}) { // a notice shows
        ImportedPMI imported(record);
        if (!loaded)
            imported.FailOnce("TarvexVisuPMI::GetDisplayName", 0);
        EXPECT_EQ(Load(imported.source, nullptr, true) != nullptr, loaded) << record.texts.size();
    }
}

TEST(VizPMILoaderTest, TessellatedTextsFollowTheEdgesWithTheStackFontAndFailuresLeaveNotices) {
    TarvexAuthoredVisuText tall = TextRecord(u"8");
    tall.font = Font{{}, 10, {}, {}}; // the builder is not given this one
    // Running along its normal: the builder refuses it.
    TarvexAuthoredVisuText const refused{u"Bad", {5, 6, 7}, {0, 0, 1}, {0, 0, 1}, {}, {}, {}};
    ImportedPMI const imported(
        PMIRecord({Line()}, {tall, TextRecord(u""), refused, TextRecord(u"  "), TextRecord(u"I")}));
    Stack stack = StackOf({Entry(A{1, 2, 3}, 60, Font{{}, 2, {}, {}})});
    std::unique_ptr<VizPMI> const pmi = Load(imported.source, &stack, true);
    ASSERT_TRUE(pmi);
    // The PMI's own line, then "8" (an outline and two holes), then "I".
    ASSERT_EQ(pmi->GetEdges().size(), 1u + 3u + 1u);
    float top = 0;
    for (std::size_t stroke = 1; stroke <= 3; ++stroke)
        for (std::size_t y = 1; y < pmi->GetEdges()[stroke]->GetVertices().size(); y += 3)
            top = std::max(top, pmi->GetEdges()[stroke]->GetVertices()[y]);
    // A round digit overshoots the capital height a little.
    EXPECT_NEAR(top, 2.0f, 0.1f) << "the digit stands as tall as the stack font says";
    EXPECT_EQ(pmi->GetEdges()[1]->GetColor(), RGBAColor(1, 2, 3, 255));
    ASSERT_EQ(pmi->GetFaces().size(), 2u);
    EXPECT_EQ(pmi->GetFaces()[0]->GetColor(), RGBAColor(1, 2, 3, 60)) << "faces keep their alpha";
    EXPECT_EQ(Join(pmi->GetTexts(), "\n"), kNotice + "(2 1 1) at 5 6 7|0 0 1|0 0 1\n" + kNotice +
                                               "(2 1 1) at 0 0 0|1 0 0|0 0 1");
}

TEST(VizPMILoaderTest, FailuresInATextAreContainedOnlyInItsTessellation) {
    for (bool const foreign : {false, true}) {
        ImportedPMI imported(PMIRecord({}, {TextRecord(u"HHHH"), TextRecord(u"H")}));
        // The PMI's own edges take one call; then three strokes of "HHHH" are made and freed,
        // and the next text goes on.
        imported.FailOnce("TarvexVisuEdgeIter::Next", 1 + 3, foreign);
        DebugCapture debug;
        std::unique_ptr<VizPMI> const pmi = Load(imported.source, nullptr, true);
        ASSERT_TRUE(pmi);
        EXPECT_EQ(imported.test.model.Faults().GetFiredCount(), 1);
        EXPECT_EQ(Join(debug.texts()), foreign ? "Failed to Tesselate Text: unknown exception"
                                               : "Failed to Tesselate Text: planned");
        EXPECT_EQ(Join(pmi->GetTexts()), kNotice + "(1 1 1) at 0 0 0|1 0 0|0 0 1");
        EXPECT_EQ(pmi->GetEdges().size(), 1u) << "only the stroke of the second text";
        EXPECT_EQ(pmi->GetFaces().size(), 1u);
    }
    // A failure outside the tessellation passes through.
    ImportedPMI imported(PMIRecord({Line()}, {TextRecord(u"A"), TextRecord(u"B")}));
    imported.FailOnce("TarvexVisuTextIter::Current", 1);
    EXPECT_THROW(Load(imported.source, nullptr, true), std::runtime_error);
}

TEST(VizViewLoaderTest, LoadsStatesNamesPlaneAndMembers) {
    TarvexVisuTriples const axis{{{1, 2, 3}, {4, 5, 6}, {7, 8, 9}}};
    TarvexAuthoredVisuView const view{true, u"Front", u"v-7", u"m-7", axis, {u"a2", u"a1", u"a2"}};
    EXPECT_EQ(Loaded<VizViewLoader>(Make<TarvexVisuView>(view)),
              "VizView hidden id=v-7 name=Front m=m-7 members a2|a1|a2 plane 1 2 3|4 5 6|7 8 9");
    EXPECT_EQ(Loaded<VizViewLoader>(Make<TarvexVisuView>(TarvexAuthoredVisuView{})), "VizView");
}

// Members are the annotations, the constructed geometry, then, when the capture manages
// geometry, a path per body: its instances' names and its part id, the names separated when
// there are several. A camera's angle or zoom, whichever its type has, is taken only with its
// orientation.
TEST(VizCaptureLoaderTest, LoadsStatesNamesCameraPlaneAndMembersWithBodyPaths) {
    TarvexVisuTestModel test; // instance 1 is "Bracket.1", 2 "Bolt.1", 3 has no name
    test.model.AddInstance(20, 30, u"Bolt.1");
    test.model.AddInstance(20, 31, std::nullopt);
    TarvexVisuTriples const plane{{{1, 2, 3}, {0, 0, 1}, {1, 0, 0}}};
    std::vector<TarvexAuthoredVisuCapture>& captures = test.Visu().captures;
    TarvexAuthoredVisuCapture full{
        true,  true,           {},       u"Capture 1", u"c-1", u"cm-1", u"shown while hidden",
        plane, {u"a1", u"a2"}, {u"cg1"}, true,         {}};
    full.bodies = {{{}, 0, u"p", true},     {{1}, 0, u"p", true},  {{1, 2}, 0, u"p", true},
                   {{3, 1}, 0, u"p", true}, {{1, 2}, 0, {}, true}, {{1}, 0, u"p", false},
                   {{}, 0, u"p", false}};
    captures = {full, full};
    captures[1].managesGeometry = false;
    TarvexVisuTriples const orientation{{{0, 0, 10}, {0, 0, 0}, {0, 1, 0}}};
    for (auto const& [type, oriented] : {std::pair{1, true}, {2, true}, {1, false}, {7, true}})
        captures.emplace_back().camera = {TarvexVisuCamera::TarvexVisuCameraType(type),
                                          oriented ? std::optional(orientation) : std::nullopt, 30,
                                          4};
    std::vector<std::string> loaded;
    for (TarvexVisuCapture const& capture : Items(test.Import().GetCaptureIterator()))
        loaded.push_back(Loaded<VizCaptureLoader>(capture));
    EXPECT_EQ(
        Join(loaded, "\n"),
        "VizCapture hidden id=c-1 active name=Capture 1 m=cm-1 members a1|a2|cg1|p|Bracket.1p|"
        "Bracket.1<KolbaSlash>Bolt.1<KolbaSlash>p|<KolbaSlash>Bracket.1<KolbaSlash>p|"
        "Bracket.1<KolbaSlash>Bolt.1<KolbaSlash>|Bracket.1| NoCamera 0 1 hidden text shown "
        "while hidden clip 1 2 3|0 0 1|1 0 0\n"
        "VizCapture hidden id=c-1 active name=Capture 1 m=cm-1 members a1|a2|cg1 NoCamera 0 1 "
        "hidden text shown while hidden clip 1 2 3|0 0 1|1 0 0\n"
        "VizCapture Perspective 30 1 oriented\n"
        "VizCapture Orthographic 0 4 oriented\n"
        "VizCapture Perspective 0 1\n"
        "VizCapture NoCamera 0 1 oriented");
}

} // namespace

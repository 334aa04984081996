#include "ImportedVisu.h"
#include "LoaderTestSupport.h"
#include "support/DebugCapture.h"

#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/loaders/VizPMILoader.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using namespace LoaderTest;
using KolbaVizCore::RGBAColor;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPMIType;
using KolbaVizCore::VizText;
using VizBridgeTarvex::VizPMILoader;
using NodeType = TarvexVisuNode::TarvexVisuNodeType;

TarvexAuthoredVisuEdge Line(std::optional<std::vector<int>> indices = std::vector<int>{0, 3}) {
    return {{}, {0, 0, 0, 1, 0, 0}, std::move(indices), TarvexVisuLine_Polyline, {}, {}};
}

std::unique_ptr<VizPMI> Load(TarvexVisuPMI const& source, std::vector<TarvexVisuAttributes>* stack,
                             bool tesselate, NodeType group = TarvexVisuNode::VisuNote,
                             NodeType type = TarvexVisuNode::VisuNote) {
    VizPMILoader loader(source, stack, group, type, tesselate);
    return LoadAs<VizPMI>(loader);
}

std::vector<VizPort::WString> Strings(std::vector<VizText*> const& texts) {
    std::vector<VizPort::WString> strings;
    for (VizText const* const text : texts)
        strings.push_back(text->GetText());
    return strings;
}

TEST(VizPMILoaderTest, TakesItsGroupFromTheFirstNodeTypeAndItsTypeFromTheSecond) {
    TarvexAuthoredVisuPMI record;
    record.edges = {Line()};
    TarvexVisuPMI const source = Make<TarvexVisuPMI>(record);
    std::unique_ptr<VizPMI> const plain = Load(source, nullptr, false, NodeType(10), NodeType(10));
    ASSERT_TRUE(plain);
    EXPECT_EQ(plain->GetGroupType(),
              VizPMIType(VizPMIType::UndefinedPMI, "VisuUnknown", KolbaVizCore::UnknownPMI));
    EXPECT_EQ(plain->GetType(), VizPMIType(VizPMIType::GenericPMI, "VisuPMI", KolbaVizCore::PMI));
    std::unique_ptr<VizPMI> const mixed = Load(source, nullptr, false, NodeType(57), NodeType(13));
    ASSERT_TRUE(mixed);
    EXPECT_EQ(mixed->GetGroupType(), VizPMIType(VizPMIType::FirstRoughness, "VisuRoughnessGroup",
                                                KolbaVizCore::Roughness));
    EXPECT_EQ(mixed->GetType(), VizPMIType(VizPMIType::ID(3), "VisuNote", KolbaVizCore::Note));
}

TEST(VizPMILoaderTest, EdgesAndTextsAreOpaqueAndInheritAndThoseWithoutContentAreLeftOut) {
    TarvexAuthoredVisuPMI record;
    TarvexAuthoredVisuEdge own = Line();
    own.rgb = {{9, 9, 9}};
    own.alpha = 10;
    record.edges = {Line(), Line(std::nullopt), own};
    record.texts = {TextRecord(u""), TextRecord(u"Ø 5"), TextRecord(std::nullopt)};
    std::vector<TarvexVisuAttributes> stack = Stack({Attributes({{1, 2, 3}}, 60)});
    std::unique_ptr<VizPMI> const pmi = Load(Make<TarvexVisuPMI>(record), &stack, false);
    ASSERT_TRUE(pmi);
    ASSERT_EQ(pmi->GetEdges().size(), 2u);
    EXPECT_EQ(pmi->GetEdges()[0]->GetColor(), RGBAColor(1, 2, 3, 255));
    EXPECT_EQ(pmi->GetEdges()[1]->GetColor(), RGBAColor(9, 9, 9, 255));
    ASSERT_EQ(Strings(pmi->GetTexts()), std::vector<VizPort::WString>{u"Ø 5"});
    EXPECT_EQ(pmi->GetTexts()[0]->GetColor(), RGBAColor(1, 2, 3, 255));
}

struct EmptinessCase {
    char const* name;
    std::vector<TarvexAuthoredVisuEdge> edges;
    std::vector<std::optional<std::u16string>> texts;
    bool loaded;
};

class VizPMILoaderEmptinessTest : public ::testing::TestWithParam<EmptinessCase> {};

TEST_P(VizPMILoaderEmptinessTest, APMIWithNothingToShowIsNullAndNotReadFurther) {
    ImportedVisu visu;
    TarvexAuthoredVisuPMI record;
    record.edges = GetParam().edges;
    for (std::optional<std::u16string> const& text : GetParam().texts)
        record.texts.push_back(TextRecord(text));
    TarvexVisuPMI const source = visu.PMI(record);
    if (!GetParam().loaded)
        visu.FailOnce("TarvexVisuPMI::GetDisplayName", 0); // would throw if it were read
    EXPECT_EQ(Load(source, nullptr, true) != nullptr, GetParam().loaded);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, VizPMILoaderEmptinessTest,
    ::testing::Values(EmptinessCase{"Nothing", {}, {}, false},
                      EmptinessCase{"EmptyTexts", {}, {u"", std::nullopt}, false},
                      EmptinessCase{"EdgesWithoutIndices", {Line(std::nullopt)}, {}, false},
                      EmptinessCase{"OneEdge", {Line()}, {}, true},
                      EmptinessCase{"OnlyATextThatLaysOutToNothing", {}, {u"  "}, true}),
    [](::testing::TestParamInfo<EmptinessCase> const& info) { return info.param.name; });

TEST(VizPMILoaderTest, TessellatedTextsFollowTheEdgesWithTheStackFontAndFailuresLeaveNotices) {
    ImportedVisu visu;
    TarvexAuthoredVisuPMI record;
    record.edges = {Line()};
    TarvexAuthoredVisuText tall = TextRecord(u"8");
    tall.font = TarvexAuthoredVisuFont{{}, 10, {}, {}}; // the builder is not given this one
    TarvexAuthoredVisuText refused = TextRecord(u"Bad");
    refused.anchor = {5, 6, 7};
    refused.direction = {0, 0, 1}; // along the normal: the builder refuses it
    record.texts = {tall, TextRecord(u""), refused, TextRecord(u"  "), TextRecord(u"I")};
    TarvexVisuPMI const source = visu.PMI(record);
    TarvexAuthoredVisuAttributes attributes = Attributes({{1, 2, 3}}, 60);
    attributes.font = TarvexAuthoredVisuFont{{}, 2, {}, {}};
    std::vector<TarvexVisuAttributes> stack = Stack({attributes});
    std::unique_ptr<VizPMI> const pmi = Load(source, &stack, true);
    ASSERT_TRUE(pmi);
    // The PMI's own line, then "8" (an outline and two holes), then "I".
    ASSERT_EQ(pmi->GetEdges().size(), 1u + 3u + 1u);
    EXPECT_EQ(pmi->GetEdges()[0]->GetVertices().size(), 6u);
    float top = 0;
    for (std::size_t stroke = 1; stroke <= 3; ++stroke)
        for (std::size_t y = 1; y < pmi->GetEdges()[stroke]->GetVertices().size(); y += 3)
            top = std::max(top, pmi->GetEdges()[stroke]->GetVertices()[y]);
    // A round digit overshoots the capital height a little.
    EXPECT_NEAR(top, 2.0f, 0.1f) << "the digit stands as tall as the stack font says";
    EXPECT_EQ(pmi->GetEdges()[1]->GetColor(), RGBAColor(1, 2, 3, 255));
    ASSERT_EQ(pmi->GetFaces().size(), 2u);
    EXPECT_EQ(pmi->GetFaces()[0]->GetColor(), RGBAColor(1, 2, 3, 60)) << "faces keep their alpha";
    EXPECT_EQ(Strings(pmi->GetTexts()),
              (std::vector<VizPort::WString>{u"Failed to Tesselate Text!",
                                             u"Failed to Tesselate Text!"}));
    EXPECT_EQ(pmi->GetTexts()[0]->GetColor(), RGBAColor(255, 255, 0, 255));
    EXPECT_EQ(pmi->GetTexts()[0]->GetAnchorPoint()[2], 7.0f) << "the notice stands in its place";
}

class VizPMILoaderTessellationFailureTest : public ::testing::TestWithParam<bool> {};

TEST_P(VizPMILoaderTessellationFailureTest,
       AFailureAfterThreeStrokesFreesThemAndTheNextTextGoesOn) {
    ImportedVisu visu;
    TarvexAuthoredVisuPMI record;
    record.texts = {TextRecord(u"HHHH"), TextRecord(u"H")};
    TarvexVisuPMI const source = visu.PMI(record);
    // The PMI's own edges take one call; then three strokes of "HHHH" are made.
    visu.FailOnce("TarvexVisuEdgeIter::Next", 1 + 3, GetParam());
    DebugCapture debug;
    std::unique_ptr<VizPMI> const pmi = Load(source, nullptr, true);
    ASSERT_TRUE(pmi);
    EXPECT_EQ(visu.test.model.Faults().GetFiredCount(), 1);
    ASSERT_EQ(debug.texts().size(), 1u);
    EXPECT_EQ(debug.texts()[0].rfind(u"Failed to Tesselate Text: ", 0), 0u) << "with its reason";
    EXPECT_EQ(Strings(pmi->GetTexts()),
              std::vector<VizPort::WString>{u"Failed to Tesselate Text!"});
    EXPECT_EQ(pmi->GetEdges().size(), 1u) << "only the stroke of the second text";
    EXPECT_EQ(pmi->GetFaces().size(), 1u);
}

INSTANTIATE_TEST_SUITE_P(StdAndForeign, VizPMILoaderTessellationFailureTest, ::testing::Bool());

TEST(VizPMILoaderTest, AFailureOutsideTessellationPassesThrough) {
    ImportedVisu visu;
    TarvexAuthoredVisuPMI record;
    record.edges = {Line()};
    record.texts = {TextRecord(u"A"), TextRecord(u"B")};
    TarvexVisuPMI const source = visu.PMI(record);
    visu.FailOnce("TarvexVisuTextIter::Current", 1);
    EXPECT_THROW(Load(source, nullptr, true), std::runtime_error);
}

TEST(VizPMILoaderTest, IsHiddenByAnyEntryOfTheStackThatHides) {
    TarvexAuthoredVisuPMI record;
    record.edges = {Line()};
    TarvexVisuPMI const source = Make<TarvexVisuPMI>(record);
    using Entries = std::vector<std::optional<bool>>; // oldest first
    for (auto const& [entries, hidden] :
         std::vector<std::pair<Entries, bool>>{{{false, true}, true},
                                               {{true, false}, true},
                                               {{std::nullopt, false}, false},
                                               {{}, false}}) {
        std::vector<TarvexAuthoredVisuAttributes> authored(entries.size());
        for (std::size_t i = 0; i < entries.size(); ++i)
            authored[i].hidden = entries[i];
        std::vector<TarvexVisuAttributes> stack = Stack(authored);
        std::unique_ptr<VizPMI> const pmi = Load(source, &stack, false);
        ASSERT_TRUE(pmi);
        EXPECT_EQ(pmi->GetHidden(), hidden) << "stack of " << entries.size();
    }
}

TEST(VizPMILoaderTest, ReadsNamesIdsAndThePartEntitiesItPointsAtInOrder) {
    ImportedVisu visu;
    TarvexAuthoredVisuPMI record;
    record.edges = {Line()};
    record.displayName = u"Note 1";
    record.id = u"v-1";
    record.mechanicalId = u"m-1";
    record.linkedElements = {{{}, 1, u"f1", true},
                             {{1}, 2, u"below-an-instance", true},
                             {{}, 3, std::nullopt, true},
                             {{}, 4, u"no-part-entity", false},
                             {{}, 5, u"e2", true}};
    std::unique_ptr<VizPMI> const pmi = Load(visu.PMI(record), nullptr, false);
    ASSERT_TRUE(pmi);
    EXPECT_EQ(pmi->GetName(), u"Note 1");
    EXPECT_EQ(pmi->GetVisualID(), u"v-1");
    EXPECT_EQ(pmi->GetMechanicalID(), u"m-1");
    EXPECT_EQ(pmi->GetLinkedEntityIDs(), (std::vector<VizPort::WString>{u"f1", u"e2"}));
}

} // namespace

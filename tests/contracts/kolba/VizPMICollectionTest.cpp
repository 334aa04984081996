#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMICollection.h>
#include <VizBridge/contracts/kolba/VizView.h>

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <vector>

using namespace KolbaVizCore;
using VizPort::WString;

namespace {

VizPMIType const note(VizPMIType::FirstNote, "VisuNote", Note);

std::vector<std::uint32_t> tagsOf(std::initializer_list<std::uint32_t> tags) {
    return tags;
}

RenderId pathOf(std::initializer_list<std::uint32_t> tags) {
    RenderId id(1);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

std::vector<float> floatsOf(float const* array) {
    return std::vector<float>(array, array + 3);
}

// The tags of the paths that GetMemberRenderIds hands out; the caller owns the array.
std::vector<std::vector<std::uint32_t>> memberPaths(VizPMICollection const& collection,
                                                    bool includeOwnPath) {
    RenderId* out = nullptr;
    int count = 0;
    if (!collection.GetMemberRenderIds(out, count, includeOwnPath))
        return {};
    std::unique_ptr<RenderId[]> const owned(out);
    std::vector<std::vector<std::uint32_t>> paths;
    for (int index = 0; index < count; ++index)
        paths.push_back(owned[index].GetTags());
    return paths;
}

} // namespace

TEST(VizPMICollection, AnElementIsAMemberByItsMechanicalOrItsVisualId) {
    VizPMI pmi(note, note);
    pmi.SetMechanicalID(u"M1");
    pmi.SetVisualID(u"V1");
    VizMesh mesh;
    mesh.SetMechanicalID(u"CG-M");
    VizEdge edge; // no visual id: only its mechanical id names it
    edge.SetMechanicalID(u"E");
    struct Case {
        std::vector<WString> members;
        VizElement const* element;
        bool member;
    } const cases[] = {
        {{u"M1"}, &pmi, true}, {{u"x", u"V1"}, &pmi, true}, {{u"M"}, &pmi, false},
        {{}, &pmi, false},     {{u""}, &edge, false},       {{u"CG-M"}, &mesh, true},
        {{u"E"}, &edge, true}, {{u"M1"}, &mesh, false},
    };
    for (Case const& c : cases) {
        VizCapture capture;
        for (WString const& key : c.members)
            capture.AddMember(key);
        EXPECT_EQ(capture.GetMembers(), c.members);
        EXPECT_EQ(capture.IsMember(*c.element), c.member)
            << c.element->GetElementType() << " with " << c.members.size() << " keys";
    }
}

TEST(VizPMICollection, MemberPathsFollowTheMemberKeysAndNameEachElementOnce) {
    VizPMI first(note, note), second(note, note), unrendered(note, note), stranger(note, note);
    first.SetMechanicalID(u"1");
    first.Set3DRenderID(pathOf({3, 10005, 10101, 1}));
    second.SetMechanicalID(u"2");
    second.Set3DRenderID(pathOf({3, 10005, 10101, 2}));
    unrendered.SetMechanicalID(u"3");
    stranger.SetMechanicalID(u"4");
    stranger.Set3DRenderID(pathOf({3, 10005, 10101, 4}));
    VizPMICollection::EntityMap map{
        {EntityId(Note, Note, 1), &first},      {EntityId(Note, Note, 2), &second},
        {EntityId(Note, Note, 3), &unrendered}, {EntityId(Note, Note, 4), &stranger},
        {EntityId(Note, Note, Note), &second}, // the group's summary entry
        {EntityId(Note, Note, 5), nullptr},
    };
    VizView view;
    for (char16_t const* key : {u"2", u"3", u"1", u"9"})
        view.AddMember(key);

    RenderId sentinel;
    RenderId* out = &sentinel;
    int count = -5;
    EXPECT_FALSE(view.GetMemberRenderIds(out, count, true)) << "no entity map, no own path";
    EXPECT_EQ(out, &sentinel);
    EXPECT_EQ(count, -5);

    view.SetEntityMap(map);
    map.clear(); // the view keeps its own copy
    view.Set3DRenderID(pathOf({3, 10010, 8}));
    EXPECT_EQ(memberPaths(view, false),
              (std::vector{tagsOf({3, 10005, 10101, 2}), tagsOf({3, 10005, 10101, 1})}));
    EXPECT_EQ(memberPaths(view, true),
              (std::vector{tagsOf({3, 10010, 8}), tagsOf({3, 10005, 10101, 2}),
                           tagsOf({3, 10005, 10101, 1})}));
}

TEST(VizPMICollection, APlaneIsOutlinedByTheParallelogramOfItsTwoDirections) {
    float const origin[3] = {1, 2, 3};
    float const first[3] = {2, 0, 0};
    float const second[3] = {0, 0, 1};
    std::vector<float> const outline{1, 2, 3, 3, 2, 3, 3, 2, 4, 1, 2, 4, 1, 2, 3};

    VizView view;
    VizCapture capture;
    VizPMICollection const* const collections[] = {&view, &capture};
    for (VizPMICollection const* collection : collections)
        EXPECT_EQ(collection->GetPlaneRectangle(), nullptr);
    EXPECT_FALSE(view.SetPlane(origin, nullptr, second)) << "an incomplete plane is no plane";
    EXPECT_FALSE(capture.SetClippingPlane(nullptr, first, second));
    EXPECT_EQ(view.GetPlaneRectangle(), nullptr);
    ASSERT_TRUE(view.SetPlane(origin, first, second));
    ASSERT_TRUE(capture.SetClippingPlane(origin, first, second));

    for (VizPMICollection const* collection : collections) {
        ASSERT_NE(collection->GetPlaneRectangle(), nullptr);
        float const* const rectangle = collection->GetPlaneRectangle();
        EXPECT_EQ(std::vector<float>(rectangle, rectangle + 15), outline);
    }
    float back[3][3] = {};
    ASSERT_TRUE(view.GetPlane(back[0], nullptr, back[2]));
    EXPECT_EQ(floatsOf(back[0]), floatsOf(origin));
    EXPECT_EQ(floatsOf(back[1]), std::vector<float>(3, 0.0f)) << "a null array is skipped";
    EXPECT_EQ(floatsOf(back[2]), floatsOf(second));
}

TEST(VizCapture, KeepsAnOrientationOnlyWhenAllThreeArraysAreGiven) {
    float const position[3] = {0, 0, 10};
    float const up[3] = {0, 1, 0};
    float back[3][3] = {{7, 7, 7}};
    VizCapture capture;
    EXPECT_FALSE(capture.SetOrientation(position, up, nullptr));
    EXPECT_FALSE(capture.GetOrientation(back[0], back[1], back[2]));
    EXPECT_EQ(floatsOf(back[0]), std::vector<float>(3, 7.0f));
    ASSERT_TRUE(capture.SetOrientation(position, position, up));
    ASSERT_TRUE(capture.GetOrientation(back[0], back[1], back[2]));
    EXPECT_EQ(floatsOf(back[1]), floatsOf(position));
    EXPECT_EQ(floatsOf(back[2]), floatsOf(up));
}

TEST(VizPMICollection, ViewsCapturesAndPMIDescribeThemselvesByNameOrNotAtAll) {
    VizView view;
    VizCapture capture;
    VizPMI pmi(note, note);
    EXPECT_EQ(view.GetViewAsString() + capture.GetCaptureAsString() + pmi.ToString(), u"");
    view.SetName(u"Front");
    capture.SetName(u"Shot");
    pmi.SetName(u"Note 1");
    EXPECT_EQ(view.GetViewAsString(), u"View : Front");
    EXPECT_EQ(capture.GetCaptureAsString(), u"Capture : Shot");
    EXPECT_EQ(pmi.ToString(), u"PMI : Note 1");
}

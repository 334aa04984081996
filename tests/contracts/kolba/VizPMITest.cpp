#include <VizBridge/contracts/kolba/VizCapture.h>
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

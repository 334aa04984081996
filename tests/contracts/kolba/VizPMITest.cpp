#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIType.h>

#include "CountedElement.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

using namespace KolbaVizCore;
using CountedElement::newCounted;

TEST(VizPMIType, IsTheValueOfItsThreePartsWithItsOwnCopyOfTheName) {
    char name[] = "VisuNote";
    VizPMIType const base(VizPMIType::FirstNote, name, Note);
    name[0] = 'X';
    EXPECT_EQ(base.GetName(), "VisuNote");
    EXPECT_EQ(VizPMIType(VizPMIType::GenericPMI, nullptr, PMI).GetName(), "");

    struct Case {
        VizPMIType other;
        bool equal;
    } const cases[] = {
        {VizPMIType(VizPMIType::FirstNote, "VisuNote", Note), true},
        {VizPMIType(VizPMIType::LastNote, "VisuNote", Note), false},
        {VizPMIType(VizPMIType::FirstNote, "VisuNoteGroup", Note), false},
        {VizPMIType(VizPMIType::FirstNote, "VisuNote", UnknownPMI), false},
    };
    for (Case const& c : cases) {
        EXPECT_EQ(base == c.other, c.equal) << c.other.GetName() << " " << c.other.GetID();
        EXPECT_EQ(base != c.other, !c.equal);
    }
}

// Run under the sanitizer build as well.
TEST(VizPMI, KeepsItsGroupAndTypeAndOwnsItsPiecesInTheOrderAdded) {
    VizPMIType const group(VizPMIType::UndefinedPMI, "VisuUnknown", UnknownPMI);
    VizPMIType const type(VizPMIType::GenericPMI, "VisuPMI", PMI);
    int freed = 0;
    auto pmi = std::make_unique<VizPMI>(group, type);
    VizEdge* const edges[] = {newCounted<VizEdge>(freed), newCounted<VizEdge>(freed)};
    VizFace* const face = newCounted<VizFace>(freed);
    VizText* const text = newCounted<VizText>(freed);
    pmi->SetEdgeCountHint(2);
    pmi->SetTextCountHint(1);
    pmi->AddEdge(edges[0]);
    pmi->AddEdge(nullptr);
    pmi->AddEdge(edges[1]);
    pmi->AddFace(face);
    pmi->AddText(nullptr);
    pmi->AddText(text);

    EXPECT_EQ(pmi->GetGroupType(), group);
    EXPECT_EQ(pmi->GetType(), type);
    EXPECT_EQ(pmi->GetEdges(), (std::vector<VizEdge*>{edges[0], edges[1]}));
    EXPECT_EQ(pmi->GetFaces(), std::vector<VizFace*>{face});
    EXPECT_EQ(pmi->GetTexts(), std::vector<VizText*>{text});
    pmi.reset();
    EXPECT_EQ(freed, 4);
}

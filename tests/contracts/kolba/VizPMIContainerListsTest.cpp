#include <VizBridge/contracts/kolba/VizPMIContainer.h>

#include "CountedElement.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

using namespace KolbaVizCore;
using CountedElement::newCounted;
using VizPort::WString;

namespace {

VizPMIType const note(VizPMIType::FirstNote, "VisuNote", Note);

// Elements cross the container interface raw; the container takes them over.
template <class Element> Element* handedOver() {
    return std::make_unique<Element>().release();
}

VizPMI* newPMI(WString const& mechanicalId, std::vector<WString> const& linkedMechIds = {}) {
    auto pmi = std::make_unique<VizPMI>(note, note);
    pmi->SetMechanicalID(mechanicalId);
    pmi->SetLinkedEntityMechIDs(linkedMechIds);
    return pmi.release();
}

} // namespace

// Run under the sanitizer build as well: there a double free or a leak fails too.
TEST(VizPMIContainerLists, TheContainerFreesEverythingItTookOverExactlyOnce) {
    int freed = 0;
    auto container = std::make_unique<VizPMIContainer>(7);
    VizPMI* const pmi = newCounted<VizPMI>(freed, note, note);
    pmi->AddEdge(newCounted<VizEdge>(freed));
    container->AddVizPMI(pmi);
    container->AddVizFTACGMesh(newCounted<VizMesh>(freed));
    container->AddVizFTACGWire(newCounted<VizWire>(freed));
    container->AddVizFTACGPointSet(newCounted<VizPointSet>(freed));
    container->AddView(newCounted<VizView>(freed));
    container->AddCapture(newCounted<VizCapture>(freed));
    container->AddVizPMI(nullptr);
    container->AddView(nullptr);
    container->AddCapture(nullptr);
    EXPECT_EQ(container->GetVizPMIs().size(), 1u) << "null is not kept";
    EXPECT_EQ(freed, 0);
    container.reset();
    EXPECT_EQ(freed, 7);
}

TEST(VizPMIContainerLists, EachListKeepsTheOrderOfAddingAndTheListsStaySeparate) {
    VizPMIContainer container(1);
    std::vector<VizPMI*> pmis;
    std::vector<VizView*> views;
    std::vector<VizCapture*> captures;
    for (int round = 0; round < 3; ++round) {
        pmis.push_back(newPMI(u"p"));
        views.push_back(handedOver<VizView>());
        captures.push_back(handedOver<VizCapture>());
        container.AddVizPMI(pmis.back());
        container.AddCapture(captures.back());
        container.AddView(views.back());
    }
    VizMesh* const mesh = handedOver<VizMesh>();
    VizPointSet* const set = handedOver<VizPointSet>();
    container.AddVizFTACGPointSet(set);
    container.AddVizFTACGMesh(mesh);

    EXPECT_EQ(container.GetVizPMIs(), pmis);
    EXPECT_EQ(container.GetViews(), views);
    EXPECT_EQ(container.GetCaptures(), captures);
    EXPECT_EQ(container.GetVizFTACGMeshes(), std::vector<VizMesh*>{mesh});
    EXPECT_TRUE(container.GetVizFTACGWires().empty());
    EXPECT_EQ(container.GetVizFTACGPointSets(), std::vector<VizPointSet*>{set});
    EXPECT_FALSE(container.HasSemanticPMI()) << "elements are no semantic records";
}

TEST(VizPMIContainerLists, FindsPMIObjectsAndTheirLinksByMechanicalId) {
    VizPMIContainer container(1);
    VizPMI* const first = newPMI(u"10", {u"30", u"face7", u"", u"20", u"30", u"10"});
    container.AddVizPMI(newPMI(u""));
    container.AddVizPMI(first);
    container.AddVizPMI(newPMI(u"20"));
    container.AddVizPMI(newPMI(u"30"));
    container.AddVizPMI(newPMI(u"10"));
    auto record = std::make_unique<SemanticPMI>();
    record->ID = u"10";
    record->BREPLinks = {EntityId(1, Face, 5), EntityId(1, Edge, 6)};
    container.AddSemanticPMI(record.release());

    EXPECT_EQ(container.GetVizPMI(u"10"), first) << "the first one added wins";
    EXPECT_EQ(container.GetVizPMI(u"11"), nullptr);
    EXPECT_EQ(container.GetVizPMI(u""), nullptr) << "an empty id names nothing";

    std::vector<WString> pmiLinks{u"stale"};
    ASSERT_TRUE(container.GetPMILinks(u"10", pmiLinks));
    EXPECT_EQ(pmiLinks, (std::vector<WString>{u"30", u"20", u"10"}))
        << "only PMI objects, in link order, each once";
    std::vector<EntityId> brepLinks;
    ASSERT_TRUE(container.GetBREPLinks(u"10", brepLinks));
    EXPECT_EQ(brepLinks, (std::vector<EntityId>{EntityId(1, Face, 5), EntityId(1, Edge, 6)}));

    std::vector<WString> untouchedPMI{u"stale"};
    std::vector<EntityId> untouchedBREP{EntityId(9, Body, 9)};
    EXPECT_FALSE(container.GetPMILinks(u"11", untouchedPMI));
    EXPECT_FALSE(container.GetBREPLinks(u"20", untouchedBREP)) << "no record under 20";
    EXPECT_EQ(untouchedPMI, std::vector<WString>{u"stale"});
    EXPECT_EQ(untouchedBREP, std::vector<EntityId>{EntityId(9, Body, 9)});
}

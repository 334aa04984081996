#include "support/BuildStructure.h"
#include "support/TestPartContainer.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizProductStructure.h>

#include <gtest/gtest.h>

namespace VizBridgeTarvex {
namespace {

using Peer = VizProductStructureTestPeer;

SemanticPMI* record(WString const& id, WString const& name) {
    auto* r = new SemanticPMI;
    r->ID = id;
    r->Name = name;
    return r;
}

TEST(VizProductStructure, ContainerLookupsNeverAddKeys) {
    auto s = Peer::make(u"P");
    auto* viz = new VizContainer(3);
    Peer::addVizContainer(*s, 3, viz);

    EXPECT_EQ(s->GetVizContainer(3), viz);
    EXPECT_EQ(s->GetVizContainer(4), nullptr);
    EXPECT_EQ(s->GetVizPMIContainer(3), nullptr);
    EXPECT_EQ(s->GetVizPartContainer(3), nullptr);
    EXPECT_EQ(s->GetNumberOfVizContainers(), 1);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 0);
    EXPECT_EQ(s->GetNumberOfVizPartContainers(), 0);
}

TEST(VizProductStructure, LoadedStatesFollowTheContainerMaps) {
    auto s = Peer::make(u"P");
    Peer::addPMIContainer(*s, 7, new VizPMIContainer(7));
    Peer::addPartContainer(*s, 8, new TestPartContainer(u"part", 8));

    EXPECT_TRUE(s->IsVizLoaded(7)) << "a PMI container alone is enough";
    EXPECT_FALSE(s->IsBREPLoaded(7));
    EXPECT_FALSE(s->IsSemanticInfoLoaded(7)) << "a container without records";
    EXPECT_TRUE(s->IsBREPLoaded(8));
    EXPECT_FALSE(s->IsVizLoaded(8));
    EXPECT_FALSE(s->IsLoaded(8)) << "no entry was built for it";
    EXPECT_FALSE(s->IsAllBREPLoaded());
    EXPECT_FALSE(s->IsAllVizLoaded());
}

TEST(VizProductStructure, NullContainersStandUnderTheirKeyAsNull) {
    auto s = Peer::make(u"P");
    Peer::addVizContainer(*s, 1, nullptr);
    Peer::addPMIContainer(*s, 1, nullptr);
    Peer::addPartContainer(*s, 1, nullptr);
    EXPECT_TRUE(s->IsVizLoaded(1));
    EXPECT_TRUE(s->IsBREPLoaded(1));
    EXPECT_EQ(s->GetVizPartContainer(1), nullptr);
    EXPECT_FALSE(s->IsSemanticInfoLoaded(1));
    EXPECT_EQ(s->GetSemanticPMIAsString(u"key"), u"");
}

TEST(VizProductStructure, ErrorMessagesComeInTheirFixedOrder) {
    auto s = Peer::make(u"P");
    Peer::setVisuError(*s, 2, u"visu 2");
    Peer::setImportError(*s, 9, u"import 9");
    Peer::addMissingFile(*s, u"b.prt");
    Peer::setVisuError(*s, 1, u"visu 1");
    Peer::setImportError(*s, 0, u"import 0");
    Peer::addMissingFile(*s, u"a.prt");

    std::vector<WString> const expected = {
        u"import 0", u"import 9",           u"visu 1",
        u"visu 2",   u"Missing File b.prt", u"Missing File a.prt"};
    EXPECT_EQ(s->GetErrorMessages(), expected);
    EXPECT_EQ(s->GetMissingFiles(), (std::vector<WString>{u"b.prt", u"a.prt"}));
}

TEST(VizProductStructure, SemanticPMIIsAnsweredByTheSmallestReferenceThatKnowsIt) {
    auto s = Peer::make(u"P");
    auto* high = new VizPMIContainer(20);
    auto* low = new VizPMIContainer(10);
    auto* empty = new VizPMIContainer(5);
    Peer::addPMIContainer(*s, 20, high);
    Peer::addPMIContainer(*s, 10, low);
    Peer::addPMIContainer(*s, 5, empty);
    high->AddSemanticPMI(record(u"K", u"from 20"));
    high->AddSemanticPMI(record(u"only20", u"x"));
    low->AddSemanticPMI(record(u"K", u"from 10"));

    SemanticPMI* found = nullptr;
    ASSERT_TRUE(s->GetSemanticPMI(u"K", found));
    EXPECT_EQ(found->Name, u"from 10");
    ASSERT_TRUE(s->GetSemanticPMI(u"only20", found));
    EXPECT_EQ(found->Name, u"x");
    found = nullptr;
    EXPECT_FALSE(s->GetSemanticPMI(u"unknown", found));
    EXPECT_EQ(found, nullptr);

    WString expected;
    ASSERT_TRUE(low->GetSemanticPMIAsString(u"K", expected));
    EXPECT_EQ(s->GetSemanticPMIAsString(u"K"), expected);
    EXPECT_EQ(s->GetSemanticPMIAsString(u"unknown"), u"");
    EXPECT_TRUE(s->IsSemanticInfoLoaded(10));
    EXPECT_FALSE(s->IsSemanticInfoLoaded(5));
}

TEST(VizProductStructure, AddSemanticPMIHandsRecordsToTheContainerAndEmptiesTheMap) {
    auto s = Peer::make(u"P");
    auto* pmi = new VizPMIContainer(4);
    Peer::addPMIContainer(*s, 4, pmi);

    SemanticPMIByKey records{
        {u"a", record(u"a", u"A")}, {u"b", nullptr}, {u"c", record(u"c", u"C")}};
    Peer::addSemanticPMI(*s, 4, &records);

    EXPECT_TRUE(records.empty());
    EXPECT_EQ(pmi->GetNumberOfSemanticPMI(), 2);
    EXPECT_TRUE(s->IsSemanticInfoLoaded(4));
    Peer::addSemanticPMI(*s, 4, nullptr); // does nothing
    EXPECT_EQ(pmi->GetNumberOfSemanticPMI(), 2);
}

TEST(VizProductStructure, RecordsWithoutAContainerAreFreedAndChangeNothing) {
    auto s = Peer::make(u"P");
    Peer::addPMIContainer(*s, 4, new VizPMIContainer(4));
    SemanticPMIByKey records{{u"a", record(u"a", u"A")}};

    Peer::addSemanticPMI(*s, 5, &records); // LeakSanitizer sees a leak if the record stays

    EXPECT_TRUE(records.empty());
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 1);
    EXPECT_FALSE(s->IsSemanticInfoLoaded(4));
    EXPECT_FALSE(s->IsVizLoaded(5));
}

TEST(VizProductStructure, RemoveGivesTheContainerBackToTheCaller) {
    auto s = Peer::make(u"P");
    auto* shared = new VizPMIContainer(1);
    Peer::addPMIContainer(*s, 3, shared);
    Peer::addPMIContainer(*s, 1, shared); // the same object under two keys
    Peer::addPMIContainer(*s, 2, new VizPMIContainer(2));

    VizPMIContainer stranger(9);
    s->RemoveVizPMIContainer(&stranger);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 3);

    s->RemoveVizPMIContainer(shared);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 2);
    EXPECT_EQ(s->GetVizPMIContainer(1), nullptr) << "the first key in order goes";
    EXPECT_EQ(s->GetVizPMIContainer(3), shared);
    s->RemoveVizPMIContainer(shared);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 1);
    s.reset();
    EXPECT_EQ(shared->GetRefID(), 1) << "still alive after the structure";
    delete shared;
}

TEST(VizProductStructure, RemovedPartContainerSurvivesTheStructure) {
    int const before = TestPartContainer::alive();
    auto s = Peer::make(u"P");
    auto* part = new TestPartContainer(u"p", 6);
    Peer::addPartContainer(*s, 6, part);
    s->RemoveVizPartContainer(part);
    EXPECT_FALSE(s->IsBREPLoaded(6));
    s.reset();
    EXPECT_EQ(TestPartContainer::alive(), before + 1);
    delete part;
    EXPECT_EQ(TestPartContainer::alive(), before);
}

TEST(VizProductStructure, OverwrittenContainersStayValidUntilTheStructureGoes) {
    int const before = TestPartContainer::alive();
    {
        auto s = Peer::make(u"P");
        auto* first = new TestPartContainer(u"first", 2);
        Peer::addPartContainer(*s, 2, first);
        Peer::addPartContainer(*s, 2, new TestPartContainer(u"second", 2));
        Peer::addPartContainer(*s, 2, new TestPartContainer(u"second", 2));
        EXPECT_EQ(s->GetNumberOfVizPartContainers(), 1);
        EXPECT_EQ(s->GetVizPartContainer(2)->GetName(), u"second");
        EXPECT_EQ(first->GetName(), u"first") << "a pointer handed out earlier still works";
        EXPECT_EQ(TestPartContainer::alive(), before + 3);
    }
    EXPECT_EQ(TestPartContainer::alive(), before) << "each freed once";
}

/// A sub-assembly (id 5) with a part (id 2) placed twice, and the part's container.
std::unique_ptr<VizProductStructure> assemblyWithPart() {
    TarvexModel model;
    model.SetProductName(u"P");
    model.AddPart(2, u"Part");
    model.AddAssembly(5, u"Sub");
    model.AddInstance(5, 2, u"Part.1");
    model.AddInstance(5, 2, u"Part.2");
    model.AddRootInstance(5, u"Sub.1");
    std::unique_ptr<VizProductStructure> structure = buildStructure(model);
    Peer::addPartContainer(*structure, 2, new TestPartContainer(u"part", 2));
    return structure;
}

/// Every entry of the tree, depth first.
void collect(std::vector<VizPSEntry*> const& entries, std::vector<VizPSEntry*>& out) {
    for (VizPSEntry* const entry : entries) {
        out.push_back(entry);
        collect(entry->GetChildren(), out);
    }
}

TEST(VizProductStructure, ACopyHasItsOwnTreeAndSharesTheContainers) {
    int const before = TestPartContainer::alive();
    for (bool originalFirst : {true, false}) {
        SCOPED_TRACE(originalFirst ? "original deleted first" : "copy deleted first");
        std::unique_ptr<VizProductStructure> original = assemblyWithPart();
        WString const tree = original->ToString();
        auto copy = std::make_unique<VizProductStructure>(*original);
        VizPartContainer* const part = original->GetVizPartContainer(2);
        (originalFirst ? original : copy).reset();
        VizProductStructure const& kept = originalFirst ? *copy : *original;

        std::vector<VizPSEntry*> entries;
        collect(kept.GetChildren(), entries);
        ASSERT_EQ(entries.size(), 3u);
        for (VizPSEntry const* const entry : entries)
            EXPECT_EQ(entry->GetProductStructure(), &kept);
        EXPECT_EQ(entries[1]->GetVizPartContainer(), part);
        EXPECT_EQ(kept.GetSubAssembly(2), entries[1]);
        EXPECT_EQ(kept.ToString(), tree);
        EXPECT_EQ(TestPartContainer::alive(), before + 1);
        (originalFirst ? copy : original).reset();
        EXPECT_EQ(TestPartContainer::alive(), before);
    }
}

TEST(VizProductStructure, AnAssignedStructureOutlivesItsSourceAndSharesRemovals) {
    std::unique_ptr<VizProductStructure> source = assemblyWithPart();
    auto target = Peer::make(u"T");
    Peer::addPartContainer(*target, 9, new TestPartContainer(u"old", 9));
    *target = *source;
    EXPECT_EQ(target->GetVizPartContainer(9), nullptr) << "the target's own map is gone";

    // A container given back through one of them is gone from both.
    std::unique_ptr<VizPartContainer> const removed(source->GetVizPartContainer(2));
    source->RemoveVizPartContainer(removed.get());
    EXPECT_FALSE(target->IsBREPLoaded(2));
    source.reset();
    EXPECT_EQ(target->GetSubAssembly(2)->GetProductStructure(), target.get());
    EXPECT_EQ(target->GetSubAssembly(2)->GetVizPartContainer(), nullptr);
}

TEST(VizPartContainer, TypeNameIsTheModelerTypeAndTheSuffix) {
    TestPartContainer part(u"p", 1);
    EXPECT_EQ(part.GetTypeName(), "TestModeler BREP Container");
    EXPECT_EQ(part.GetName(), u"p");
    EXPECT_EQ(part.GetRefID(), 1);
}

} // namespace
} // namespace VizBridgeTarvex

#include "support/BuildStructure.h"
#include "support/TestPartContainer.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/import/VizPSInstanceBuilder.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <array>
#include <optional>
#include <string>

namespace VizBridgeTarvex {
namespace {

using Peer = VizProductStructureTestPeer;

/// The entry made for a root instance of `model`, on its own.
std::unique_ptr<VizPSEntry> rootEntry(TarvexModel const& model, int root = 0) {
    TarvexInputPSInstance const input = model.GetInputProductStructure().GetRootInstance(root);
    VizPSEntry* entry = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(input, input.GetReference(), entry);
    return std::unique_ptr<VizPSEntry>(entry);
}

TEST(VizPSEntry, FollowsTheInstanceColourAndAlpha) {
    using RGB = std::optional<std::array<unsigned short, 3>>;
    struct Case {
        RGB rgb;
        std::optional<unsigned short> alpha;
        char const* expected; ///< the colour, then whether the entry has a colour and an alpha
    };
    Case const cases[] = {
        {std::nullopt, std::nullopt, "0,0,0,255"},
        {RGB({10, 20, 30}), std::nullopt, "10,20,30,255 colour"},
        {RGB({1, 2, 3}), 255, "1,2,3,255 colour"}, // opaque: no alpha
        {RGB({1, 2, 3}), 128, "1,2,3,128 colour alpha"},
        {std::nullopt, 64, "0,0,0,64 alpha"},
        {RGB({0x1FF, 0x280, 0xFFFF}), 0x1FF, "255,128,255,255 colour alpha"}, // the low bytes
    };
    for (Case const& c : cases) {
        TarvexModel model;
        model.AddPart(42, u"ref");
        TarvexAuthoredInstance& instance = model.AddRootInstance(42, u"inst");
        instance.rgb = c.rgb;
        instance.alpha = c.alpha;
        auto const entry = rootEntry(model);
        RGBAColor const color = entry->GetColor();
        EXPECT_EQ(std::to_string(color.red) + ',' + std::to_string(color.green) + ',' +
                      std::to_string(color.blue) + ',' + std::to_string(color.alpha) +
                      (entry->HasColor() ? " colour" : "") + (entry->HasAlpha() ? " alpha" : ""),
                  c.expected);
    }
}

TEST(VizPSEntry, TakesNamesIdFlagsAndPlacementFromTheInput) {
    TarvexModel model;
    model.AddPart(42, u"ref", u"ref.prt");
    TarvexAuthoredInstance& instance = model.AddRootInstance(42, u"inst");
    TarvexPlacement const placement{{{0, -1, 0}, {1, 0, 0}, {0, 0, 1}}, {5, 6, 7}};
    instance.placement = placement;
    instance.hidden = true;
    instance.suppressed = false;

    auto const entry = rootEntry(model);
    EXPECT_EQ(entry->ToString(0), u"Part: instance: inst of reference: ref\n");
    EXPECT_TRUE(entry->IsHidden());
    EXPECT_FALSE(entry->IsSuppressed());
    EXPECT_EQ(entry->GetTransformation(), VizTransf(placement.rotation, placement.translation));
    EXPECT_EQ(entry->GetVizContainer(), nullptr) << "no structure to ask";
    EXPECT_EQ(entry->GetVizPartContainer(), nullptr);

    SharedProduct product;
    auto const assembly = rootEntry(product.model, 2); // A.1, without its children
    assembly->AddChild(nullptr);                       // stored as given, printed as nothing
    EXPECT_EQ(assembly->GetNumberOfChildren(), 1);
    EXPECT_EQ(assembly->ToString(1), u"   Product: instance: A.1 of reference: Asm\n");
}

TEST(VizPSEntry, AFailingInputLeavesOutUntouchedAndFreesTheEntry) {
    SharedProduct product;
    product.model.Faults().Add(
        {"TarvexInputPSInstance::GetAlphaColor", std::nullopt, TarvexFaultKind::NonStdException});
    TarvexInputPSInstance const input = product.model.GetInputProductStructure().GetRootInstance(0);
    TarvexInputPSReference const reference = input.GetReference();
    VizPSEntry* out = nullptr;
    EXPECT_THROW(VizPSInstanceBuilder::MakeVizPSInstance(input, reference, out),
                 TarvexForeignError);
    EXPECT_EQ(out, nullptr) << "LeakSanitizer checks that the half-made entry was freed";
}

SemanticPMI* record(WString const& id, WString const& name) {
    auto* r = new SemanticPMI;
    r->ID = id;
    r->Name = name;
    return r;
}

TEST(VizProductStructure, LookupsAndLoadedStatesFollowTheContainerMaps) {
    auto s = Peer::make(u"P");
    auto* viz = new VizContainer(3);
    Peer::addVizContainer(*s, 3, viz);
    Peer::addPMIContainer(*s, 7, new VizPMIContainer(7));
    Peer::addPartContainer(*s, 8, new TestPartContainer(u"part", 8));
    Peer::addVizContainer(*s, 1, nullptr); // null containers stand under their key as null
    Peer::addPartContainer(*s, 1, nullptr);
    EXPECT_EQ(s->GetVizContainer(3), viz);
    std::string states;
    for (int id : {1, 3, 4, 7, 8}) {
        states +=
            ' ' + std::to_string(id) + (s->IsVizLoaded(id) ? " viz" : "") +
            (s->IsBREPLoaded(id) ? " brep" : "") + (s->GetVizPartContainer(id) ? " part" : "") +
            (s->GetVizPMIContainer(id) ? " pmi" : "") +
            (s->IsSemanticInfoLoaded(id) ? " semantic" : "") + (s->IsLoaded(id) ? " entry" : "");
    }
    // A PMI container alone is enough, without records; no entry was built for any of them.
    EXPECT_EQ(states, " 1 viz brep 3 viz 4 7 viz pmi 8 brep part");
    EXPECT_EQ(s->GetNumberOfVizContainers(), 2) << "lookups add no key";
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 1);
    EXPECT_EQ(s->GetNumberOfVizPartContainers(), 2);
}

TEST(VizProductStructure, ErrorMessagesComeInTheirFixedOrder) {
    auto s = Peer::make(u"P");
    Peer::setVisuError(*s, 2, u"visu 2");
    Peer::setImportError(*s, 9, u"import 9");
    Peer::addMissingFile(*s, u"b.prt");
    Peer::setVisuError(*s, 1, u"visu 1");
    Peer::setImportError(*s, 0, u"import 0");
    Peer::addMissingFile(*s, u"a.prt");

    EXPECT_EQ(reportLines("", s->GetErrorMessages()),
              "import 0\nimport 9\nvisu 1\nvisu 2\nMissing File b.prt\nMissing File a.prt\n");
}

TEST(VizProductStructure, SemanticPMIIsFiledByReferenceAndTheSmallestThatKnowsItAnswers) {
    auto s = Peer::make(u"P");
    auto* low = new VizPMIContainer(10);
    Peer::addPMIContainer(*s, 20, new VizPMIContainer(20));
    Peer::addPMIContainer(*s, 10, low);
    Peer::addPMIContainer(*s, 5, new VizPMIContainer(5)); // without records
    Peer::addPMIContainer(*s, 1, nullptr);
    SemanticPMIByKey records{
        {u"K", record(u"K", u"from 20")}, {u"b", nullptr}, {u"only20", record(u"only20", u"x")}};
    Peer::addSemanticPMI(*s, 20, &records);
    EXPECT_TRUE(records.empty()) << "the container owns the records now";
    SemanticPMI* const lowK = record(u"K", u"from 10");
    records = {{u"K", lowK}};
    Peer::addSemanticPMI(*s, 10, &records);
    records = {{u"d", record(u"d", u"D")}};
    Peer::addSemanticPMI(*s, 30, &records); // no container: freed, or LeakSanitizer sees it
    Peer::addSemanticPMI(*s, 10, nullptr);  // does nothing
    EXPECT_EQ(s->GetVizPMIContainer(20)->GetNumberOfSemanticPMI(), 2);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 4);

    SemanticPMI* found = nullptr;
    ASSERT_TRUE(s->GetSemanticPMI(u"K", found));
    EXPECT_EQ(found, lowK);
    ASSERT_TRUE(s->GetSemanticPMI(u"only20", found));
    EXPECT_EQ(found->Name, u"x");
    found = nullptr;
    EXPECT_FALSE(s->GetSemanticPMI(u"unknown", found));
    EXPECT_EQ(found, nullptr);
    EXPECT_EQ(s->GetSemanticPMIAsString(u"K"), lowK->ToString());
    EXPECT_EQ(s->GetSemanticPMIAsString(u"unknown"), u"");
    EXPECT_TRUE(s->IsSemanticInfoLoaded(10));
    EXPECT_FALSE(s->IsSemanticInfoLoaded(5));
}

TEST(VizProductStructure, RemoveGivesTheContainerBackToTheCaller) {
    auto s = Peer::make(u"P");
    auto* shared = new VizPMIContainer(1);
    Peer::addPMIContainer(*s, 3, shared);
    Peer::addPMIContainer(*s, 1, shared); // the same object under two keys
    Peer::addPMIContainer(*s, 2, new VizPMIContainer(2));
    auto* part = new TestPartContainer(u"part", 4);
    Peer::addPartContainer(*s, 4, part);
    s->RemoveVizPartContainer(part);
    EXPECT_FALSE(s->IsBREPLoaded(4));

    VizPMIContainer stranger(9);
    s->RemoveVizPMIContainer(&stranger);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 3);
    s->RemoveVizPMIContainer(shared);
    EXPECT_EQ(s->GetVizPMIContainer(1), nullptr) << "the first key in order goes";
    EXPECT_EQ(s->GetVizPMIContainer(3), shared);
    s->RemoveVizPMIContainer(shared);
    EXPECT_EQ(s->GetNumberOfVizPMIContainers(), 1);
    s.reset();
    EXPECT_EQ(shared->GetRefID(), 1) << "both still alive after the structure";
    EXPECT_EQ(part->GetRefID(), 4);
    delete shared;
    delete part;
}

// A copy, or a structure assigned to, files a container over PartP's: the maps are shared, and
// the container it replaces stays valid until the last structure goes.
TEST(VizProductStructure, ACopyHasItsOwnTreeAndSharesTheContainers) {
    int const before = TestPartContainer::alive();
    struct Case {
        bool assign, originalFirst;
    };
    for (Case const c : {Case{false, true}, Case{false, false}, Case{true, true}}) {
        SCOPED_TRACE(std::to_string(c.assign) + std::to_string(c.originalFirst));
        std::unique_ptr<VizProductStructure> original = buildStructure(SharedProduct().model);
        auto* const first = new TestPartContainer(u"first", 10);
        Peer::addPartContainer(*original, 10, first);
        WString const tree = original->ToString();
        std::unique_ptr<VizProductStructure> copy;
        if (c.assign) {
            copy = Peer::make(u"T");
            Peer::addPartContainer(*copy, 9, new TestPartContainer(u"old", 9));
            *copy = *original;
            EXPECT_EQ(copy->GetVizPartContainer(9), nullptr) << "its own maps are gone";
        } else {
            copy = std::make_unique<VizProductStructure>(*original);
        }
        auto* const part = new TestPartContainer(u"part", 10);
        Peer::addPartContainer(*copy, 10, part);
        EXPECT_EQ(original->GetVizPartContainer(10), part);
        EXPECT_EQ(original->GetNumberOfVizPartContainers(), 1);
        (c.originalFirst ? original : copy).reset();
        VizProductStructure const& kept = c.originalFirst ? *copy : *original;

        // Read through the kept structure's own entries: P.1, and P.2 two levels down.
        VizPSEntry const* const p1 = kept.GetChildren().at(0);
        VizPSEntry const* const p2 =
            kept.GetChildren().at(1)->GetChildren().at(1)->GetChildren()[0];
        for (VizPSEntry const* const entry : {p1, p2}) {
            EXPECT_EQ(entry->GetProductStructure(), &kept);
            EXPECT_EQ(entry->GetVizPartContainer(), part);
        }
        EXPECT_EQ(kept.GetSubAssembly(10), p1);
        EXPECT_EQ(kept.ToString(), tree);
        EXPECT_EQ(first->GetTypeName(), "TestModeler BREP Container");
        EXPECT_EQ(TestPartContainer::alive(), before + 2);
        (c.originalFirst ? copy : original).reset();
        EXPECT_EQ(TestPartContainer::alive(), before) << "each freed once";
    }
}

} // namespace
} // namespace VizBridgeTarvex
